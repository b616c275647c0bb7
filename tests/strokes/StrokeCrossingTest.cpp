// SPDX-License-Identifier: MIT
// Where a straight way meets a stroke, also compared with many points along the way.
#include "strokes/StrokeCrossing.h"

#include "StrokeFixture.h"
#include "strokes/StrokeHitTest.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <cmath>

namespace penwick::test {
namespace {

using platform::BezierPath;
using platform::Point;

constexpr double tolerance = 2e-6; // points: what is added, and what is rounded

/// The place on the way where the stroke is met; nothing where it is not.
std::optional<Point> meeting(Way way, const BezierPath &path)
{
    const auto part = meetingOn(way, path).part;
    if (!part)
        return std::nullopt;
    EXPECT_TRUE(strokeContains(path, way.at(*part)));
    return way.at(*part);
}

void expectMeeting(Way way, const BezierPath &path, Point expected)
{
    const auto met = meeting(way, path);
    ASSERT_TRUE(met);
    EXPECT_NEAR(met->x, expected.x, tolerance);
    EXPECT_NEAR(met->y, expected.y, tolerance);
}

TEST(StrokeCrossing, lineIsMetAtItsEdge)
{
    const StrokeEntry line = lineAt(20); // from 10 to 50, two points to either side

    expectMeeting({ { 30, 0 }, { 30, 90 } }, *line.bPath, { 30, 18 });
    expectMeeting({ { 30, 90 }, { 30, 0 } }, *line.bPath, { 30, 22 });
    expectMeeting({ { 0, 20 }, { 90, 20 } }, *line.bPath, { 8, 20 }); // at its round end
    expectMeeting({ { 90, 21 }, { 0, 21 } }, *line.bPath, { 50 + std::sqrt(3.0), 21 });
    expectMeeting({ { 20, 10 }, { 40, 30 } }, *line.bPath, { 28, 18 });
}

TEST(StrokeCrossing, strokeThatIsThereFromTheBeginningIsMetThere)
{
    const StrokeEntry line = lineAt(20);

    expectMeeting({ { 30, 20 }, { 30, 90 } }, *line.bPath, { 30, 20 });
    expectMeeting({ { 30, 21 }, { 31, 21 } }, *line.bPath, { 30, 21 });
}

TEST(StrokeCrossing, strokeThatIsMetOnlyAtTheEndOrNotAtAllIsNotMet)
{
    const StrokeEntry line = lineAt(20);

    EXPECT_FALSE(meeting({ { 30, 0 }, { 30, 18 } }, *line.bPath));
    EXPECT_FALSE(meeting({ { 30, 0 }, { 30, 17 } }, *line.bPath));
    EXPECT_FALSE(meeting({ { 0, 23 }, { 90, 23 } }, *line.bPath));
    EXPECT_FALSE(meeting({ { 53, 0 }, { 53, 90 } }, *line.bPath));
    EXPECT_FALSE(meeting({ { 30, 22 }, { 30, 90 } }, *line.bPath)); // it is left at once
    EXPECT_FALSE(meeting({ { 30, 20 }, { 30, 20 } }, *line.bPath)); // no way
    EXPECT_TRUE(meeting({ { 30, 0 }, { 30, 18.1 } }, *line.bPath));
}

TEST(StrokeCrossing, whatLiesAtTheEndIsToldWhetherOrNotItIsMetBefore)
{
    const StrokeEntry line = lineAt(20);
    const auto isAtEnd = [&line](Way way) { return meetingOn(way, *line.bPath).isAtEnd; };

    EXPECT_TRUE(isAtEnd({ { 30, 0 }, { 30, 18 } })); // exactly half the thickness away
    EXPECT_TRUE(isAtEnd({ { 30, 0 }, { 30, 22 } }));
    EXPECT_TRUE(isAtEnd({ { 30, 20 }, { 30, 20 } }));
    EXPECT_FALSE(isAtEnd({ { 30, 0 }, { 30, 17.9999999 } }));
    EXPECT_FALSE(isAtEnd({ { 30, 0 }, { 30, 90 } }));
    EXPECT_FALSE(isAtEnd({ { 30, 23 }, { 30, 23 } }));
}

TEST(StrokeCrossing, lineThatRunsBesideTheWayAtHalfItsWidthIsMet)
{
    const StrokeEntry line = lineAt(20);

    expectMeeting({ { 0, 22 }, { 90, 22 } }, *line.bPath, { 10, 22 });
}

TEST(StrokeCrossing, dotIsMetAndAStrokeWithoutLinesOrThicknessIsNot)
{
    BezierPath path;
    path.setLineWidth(10);
    EXPECT_FALSE(meeting({ { 0, 0 }, { 90, 0 } }, path));
    path.moveToPoint({ 40, 3 });
    EXPECT_FALSE(meeting({ { 0, 0 }, { 90, 0 } }, path));
    path.lineToPoint({ 40, 3 });
    expectMeeting({ { 0, 0 }, { 90, 0 } }, path, { 36, 0 });

    path.setLineWidth(0);
    EXPECT_FALSE(meeting({ { 0, 3 }, { 90, 3 } }, path));
}

TEST(StrokeCrossing, ofSeveralLinesTheOneThatIsMetFirstCounts)
{
    BezierPath path;
    path.setLineWidth(4);
    for (const double x : { 70.0, 30.0, 50.0 }) {
        path.moveToPoint({ x, 0 });
        path.lineToPoint({ x, 40 });
    }

    expectMeeting({ { 0, 20 }, { 90, 20 } }, path, { 28, 20 });
    expectMeeting({ { 90, 20 }, { 0, 20 } }, path, { 72, 20 });
}

/// The first of many points along the way that lies on the stroke, found by asking each.
std::optional<double> firstAskedPoint(Way way, const BezierPath &path, int points)
{
    for (int point = 1; point < points; ++point) {
        const double part = static_cast<double>(point) / points;
        if (strokeContains(path, way.at(part)))
            return part;
    }
    return std::nullopt;
}

RC_GTEST_PROP(StrokeCrossingProperties, meetsWhatManyPointsOnTheWayMeetAndNoLater, ())
{
    const StrokeEntry stroke = anyStroke();
    const Way way { anyPoint(), anyPoint() };
    constexpr int points = 2000;

    const auto part = meetingOn(way, *stroke.bPath).part;
    const auto asked = firstAskedPoint(way, *stroke.bPath, points);

    RC_ASSERT(meetingOn(way, *stroke.bPath).isAtEnd == strokeContains(*stroke.bPath, way.to));
    if (part)
        RC_ASSERT(strokeContains(*stroke.bPath, way.at(*part)));
    if (!asked)
        return; // it may have been grazed between two points
    RC_ASSERT(part.has_value());
    const double added = tolerance / way.length();
    RC_ASSERT(*part <= *asked + added);
    // Between two points it may leave the stroke and come back, but not stay away for longer.
    RC_ASSERT(*part < 2 * added
        || !firstAskedPoint({ way.from, way.at(*part - 2 * added) }, *stroke.bPath, points));
}

} // namespace
} // namespace penwick::test
