// SPDX-License-Identifier: MIT
// The index against asking every stroke.
#include "strokes/StrokeIndex.h"

#include "StrokeFixture.h"
#include "strokes/StrokeHitTest.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <utility>

namespace penwick::test {
namespace {

using platform::Point;
using platform::Rect;

TEST(StrokeIndex, findsTheOldestOfTheStrokesUnderAPointAndTheNewestTooWhichStillGrows)
{
    EntryList<StrokeEntry> strokes;
    for (const double y : { 10.0, 11.0, 40.0 })
        strokes.append(lineAt(y));
    StrokeIndex index;
    index.follow(strokes);

    EXPECT_EQ(index.oldestAt({ 20, 10.5 }), 0);
    EXPECT_EQ(index.oldestAt({ 20, 12.5 }), 1);
    EXPECT_EQ(index.oldestAt({ 20, 42 }), 2); // exactly half the thickness away
    EXPECT_EQ(index.oldestAt({ 20, 42.01 }), std::nullopt);
    EXPECT_EQ(index.oldestAt({ 60, 41 }), std::nullopt);

    strokes.last().bPath->moveToPoint({ 50, 40 });
    strokes.last().bPath->lineToPoint({ 90, 40 });
    EXPECT_EQ(index.oldestAt({ 60, 41 }), 2);
}

TEST(StrokeIndex, touchingGivesIndicesOldestFirstThicknessIncluded)
{
    EntryList<StrokeEntry> strokes;
    for (const double y : { 40.0, 10.0, 11.0 })
        strokes.append(lineAt(y));
    StrokeIndex index;
    EXPECT_TRUE(index.touching({ 0, 0, 100, 100 }).empty());
    index.follow(strokes);

    EXPECT_EQ(index.touching({ 0, 0, 100, 100 }), (std::vector { 0, 1, 2 }));
    EXPECT_EQ(index.touching({ 0, 12.5, 100, 10 }), (std::vector { 2 }));
    EXPECT_EQ(index.touching({ 0, 30, 100, 8 }), (std::vector { 0 }));
    EXPECT_TRUE(index.touching({ 0, 20, 100, 10 }).empty());
}

TEST(StrokeIndex, strokeThatIsNewestAgainMayGrowAgain)
{
    EntryList<StrokeEntry> strokes;
    strokes.append(lineAt(10));
    strokes.append(lineAt(40));
    StrokeIndex index;
    index.follow(strokes);
    strokes.removeLast();
    index.follow(strokes);

    strokes.last().bPath->moveToPoint({ 50, 10 });
    strokes.last().bPath->lineToPoint({ 50, 90 });
    EXPECT_EQ(index.oldestAt({ 50, 80 }), 0);

    strokes.append(lineAt(70));
    index.follow(strokes);
    EXPECT_EQ(index.oldestAt({ 50, 80 }), 0);
}

TEST(StrokeIndex, whatChangesBetweenTwoQuestionsIsTakenInWithTheSecond)
{
    EntryList<StrokeEntry> strokes;
    for (int number = 1; number <= 200; ++number)
        strokes.append(lineAt(number * 10.0));
    StrokeIndex index;
    index.follow(strokes);
    ASSERT_EQ(index.oldestAt({ 20, 510 }), 50);

    for (const int gone : { 50, 0, strokes.size() - 3 }) {
        strokes.removeAt(gone);
        index.follow(strokes);
    }
    for (const double y : { 3000.0, 3010.0 }) {
        strokes.append(lineAt(y));
        index.follow(strokes);
    }

    for (const double y : { 10.0, 510.0, 2000.0 })
        EXPECT_EQ(index.oldestAt({ 20, y }), std::nullopt) << y;
    EXPECT_EQ(index.oldestAt({ 20, 20 }), 0);
    EXPECT_EQ(index.oldestAt({ 20, 520 }), 49);
    EXPECT_EQ(index.oldestAt({ 20, 1990 }), 196);
    EXPECT_EQ(index.oldestAt({ 20, 3000 }), 197);
    EXPECT_EQ(index.oldestAt({ 20, 3010 }), 198);
    EXPECT_EQ(index.touching({ 0, 0, 100, 4000 }).size(), 199U);
}

TEST(StrokeIndex, meetingPointsAreInTheOrderOfTheWayAndOldestFirstWhereStrokesAreMetAtOnce)
{
    EntryList<StrokeEntry> strokes;
    for (const double y : { 70.0, 30.0, 30.0, 95.0, 50.0 })
        strokes.append(lineAt(y));
    StrokeIndex index;
    index.follow(strokes);

    const std::vector<Point> up = index.meetingsOn({ { 20, 0 }, { 20, 93 } }).places;

    ASSERT_EQ(up.size(), 4U); // the stroke at 95 is met only at the end
    EXPECT_NEAR(up[0].y, 28, 1e-5);
    EXPECT_EQ(up[1], up[0]);
    EXPECT_NEAR(up[2].y, 48, 1e-5);
    EXPECT_NEAR(up[3].y, 68, 1e-5);
    EXPECT_EQ(index.oldestAt(up[0]), 1);
    const std::vector<Point> down = index.meetingsOn({ { 20, 94 }, { 20, 49 } }).places;
    ASSERT_EQ(down.size(), 3U);
    EXPECT_NEAR(down[0].y, 94, 1e-5); // there from the beginning
    EXPECT_NEAR(down[1].y, 72, 1e-5);
    EXPECT_NEAR(down[2].y, 52, 1e-5);
}

TEST(StrokeIndex, wayAcrossEverythingMeetsEachStrokeOnce)
{
    EntryList<StrokeEntry> strokes;
    for (int number = 1; number <= 200; ++number)
        strokes.append(lineAt(number * 10.0));
    StrokeIndex index;
    index.follow(strokes);

    EXPECT_EQ(index.meetingsOn({ { 11, -100 }, { 49, 1e4 } }).places.size(), 200U);
    EXPECT_EQ(index.meetingsOn({ { 30, -1e9 }, { 30, 1e9 } }).places.size(), 200U);
    EXPECT_TRUE(index.meetingsOn({ { 60, -100 }, { 60, 1e4 } }).places.empty());
}

RC_GTEST_PROP(StrokeIndexProperties, meetsOnAWayWhatAskingEveryStrokeMeets, ())
{
    AnyDrawing drawing;
    StrokeIndex index;
    const int steps = *rc::gen::inRange(1, 80);
    for (int step = 0; step < steps; ++step) {
        drawing.change();
        index.follow(drawing.strokes());
        if (*rc::gen::inRange(0, 3) == 0)
            continue; // several changes for one question

        const Way way { anyPoint(), anyPoint() };
        std::vector<std::pair<double, int>> met;
        bool isAtEnd = false;
        for (int stroke = 0; stroke < drawing.strokes().size(); ++stroke) {
            const Meeting meeting = meetingOn(way, *drawing.strokes()[stroke].bPath);
            isAtEnd = isAtEnd || meeting.isAtEnd;
            if (meeting.part)
                met.emplace_back(*meeting.part, stroke);
        }
        std::ranges::sort(met);
        std::vector<Point> points;
        for (const auto &[part, stroke] : met)
            points.push_back(way.at(part));
        RC_ASSERT(index.meetingsOn(way).places == points);
        RC_ASSERT(index.meetingsOn(way).isAtEnd == isAtEnd);
    }
}

RC_GTEST_PROP(StrokeIndexProperties, answersAsAskingEveryStrokeDoes, ())
{
    AnyDrawing drawing;
    StrokeIndex index;
    const int steps = *rc::gen::inRange(1, 80);
    for (int step = 0; step < steps; ++step) {
        drawing.change();
        index.follow(drawing.strokes());
        if (*rc::gen::inRange(0, 3) == 0)
            continue;

        const Point point = anyPoint();
        RC_ASSERT(index.oldestAt(point)
            == drawing.strokes().firstIndexWhere(
                [point](const StrokeEntry &entry) { return strokeContains(*entry.bPath, point); }));
        const Rect area { point.x, point.y, 30, 10 };
        const std::vector<int> touching = index.touching(area);
        RC_ASSERT(std::ranges::is_sorted(touching));
        for (int stroke = 0; stroke < drawing.strokes().size(); ++stroke) {
            const platform::BezierPath &path = *drawing.strokes()[stroke].bPath;
            const bool touches
                = path.controlPointBounds().grownBy(path.lineWidth() / 2).intersects(area);
            if (touches)
                RC_ASSERT(std::ranges::binary_search(touching, stroke));
        }
    }
}

} // namespace
} // namespace penwick::test
