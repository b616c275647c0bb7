// SPDX-License-Identifier: MIT
// Distances from a stroke's centre line, to the last fraction of a point.
#include "strokes/StrokeHitTest.h"

#include <penwick/platform/BezierPath.h>

#include <gtest/gtest.h>

#include <cmath>

namespace penwick::test {
namespace {

using platform::BezierPath;
using platform::Point;

/// Twenty points to the right from (10, 10), as the model builds it.
void addLine(BezierPath &path)
{
    path.moveToPoint({ 10, 10 });
    path.lineToPoint({ 30, 10 });
}

TEST(StrokeHitTest, pathWithoutElementsIsHitNowhere)
{
    BezierPath path;
    path.setLineWidth(1000);

    EXPECT_FALSE(strokeContains(path, { 0, 0 }));
}

TEST(StrokeHitTest, pathOfMovesAloneIsHitNowhere)
{
    BezierPath path;
    path.setLineWidth(5);
    path.moveToPoint({ 10, 10 });
    path.moveToPoint({ 20, 10 });

    EXPECT_FALSE(strokeContains(path, { 10, 10 }));
    EXPECT_FALSE(strokeContains(path, { 20, 10 }));
}

TEST(StrokeHitTest, lineWithoutThicknessIsHitNowhere)
{
    BezierPath path;
    addLine(path);

    for (const double width : { 0.0, -5.0 }) {
        path.setLineWidth(width);
        EXPECT_FALSE(strokeContains(path, { 20, 10 })) << width;
    }
}

TEST(StrokeHitTest, lineIsHitUpToHalfItsWidthAway)
{
    BezierPath path;
    path.setLineWidth(5);
    addLine(path);

    EXPECT_TRUE(strokeContains(path, { 20, 10 }));
    EXPECT_TRUE(strokeContains(path, { 20, 12.5 }));
    EXPECT_TRUE(strokeContains(path, { 20, 7.5 }));
    EXPECT_FALSE(strokeContains(path, { 20, 12.5000001 }));
    EXPECT_FALSE(strokeContains(path, { 20, 7.4999999 }));
}

TEST(StrokeHitTest, endsAreRound)
{
    BezierPath path;
    path.setLineWidth(5);
    addLine(path);

    EXPECT_TRUE(strokeContains(path, { 32.5, 10 }));
    EXPECT_TRUE(strokeContains(path, { 7.5, 10 }));
    EXPECT_TRUE(strokeContains(path, { 31.5, 12 })); // 1.5 along and 2 across: 2.5 away
    EXPECT_FALSE(strokeContains(path, { 32, 12 })); // inside a square end
    EXPECT_FALSE(strokeContains(path, { 7.4999999, 10 }));
}

TEST(StrokeHitTest, attributesOfEndsAndJoinsDoNotMatter)
{
    BezierPath path;
    path.setLineWidth(5);
    path.setLineCapStyle(platform::LineCapStyle::Butt);
    addLine(path);

    EXPECT_TRUE(strokeContains(path, { 32.5, 10 }));
}

TEST(StrokeHitTest, lineToWhereItBeganIsADot)
{
    BezierPath path;
    path.setLineWidth(5);
    path.moveToPoint({ 10, 10 });
    path.lineToPoint({ 10, 10 });

    EXPECT_TRUE(strokeContains(path, { 10, 10 }));
    EXPECT_TRUE(strokeContains(path, { 11.5, 12 }));
    EXPECT_FALSE(strokeContains(path, { 12, 12 }));
}

TEST(StrokeHitTest, everySegmentOfAStrokeIsHitAndTheGapBetweenSubpathsIsNot)
{
    BezierPath path;
    path.setLineWidth(4);
    addLine(path);
    path.moveToPoint({ 60, 10 });
    path.lineToPoint({ 60, 50 });

    EXPECT_TRUE(strokeContains(path, { 20, 11 }));
    EXPECT_TRUE(strokeContains(path, { 61, 30 }));
    EXPECT_FALSE(strokeContains(path, { 45, 10 }));
    EXPECT_FALSE(strokeContains(path, { 45, 30 })); // inside the bounds of the whole
}

TEST(StrokeHitTest, slantedLineIsMeasuredSquareToItself)
{
    BezierPath path;
    path.setLineWidth(10);
    path.moveToPoint({ 0, 0 });
    path.lineToPoint({ 40, 30 });

    EXPECT_TRUE(strokeContains(path, { 20 - 2.9, 15 + 3.9 }));
    EXPECT_FALSE(strokeContains(path, { 20 - 3.1, 15 + 4.1 }));
}

TEST(StrokeHitTest, widthOfTheMomentCounts)
{
    BezierPath path;
    path.setLineWidth(5);
    addLine(path);
    EXPECT_FALSE(strokeContains(path, { 20, 15 }));

    path.setLineWidth(10);

    EXPECT_TRUE(strokeContains(path, { 20, 15 }));
}

TEST(StrokeHitTest, closedPathIsHitOnItsClosingLineAndNotInside)
{
    BezierPath path;
    path.setLineWidth(2);
    path.moveToPoint({ 0, 0 });
    path.lineToPoint({ 40, 0 });
    path.lineToPoint({ 40, 40 });
    path.closePath();

    EXPECT_TRUE(strokeContains(path, { 20, 20 }));
    EXPECT_FALSE(strokeContains(path, { 30, 10 }));
}

TEST(StrokeHitTest, curveIsHitAlongItself)
{
    // A quarter of a circle of radius 100 around the origin, good to 0.03.
    const double k = 55.228474983;
    BezierPath path;
    path.setLineWidth(10);
    path.moveToPoint({ 100, 0 });
    path.curveToPoint({ 0, 100 }, { 100, k }, { k, 100 });

    for (int degrees = 1; degrees < 90; ++degrees) {
        const double angle = degrees * 3.14159265358979 / 180;
        const auto at = [angle](double radius) {
            return Point { radius * std::cos(angle), radius * std::sin(angle) };
        };
        EXPECT_TRUE(strokeContains(path, at(104.9))) << degrees;
        EXPECT_TRUE(strokeContains(path, at(95.1))) << degrees;
        EXPECT_FALSE(strokeContains(path, at(105.1))) << degrees;
        EXPECT_FALSE(strokeContains(path, at(94.9))) << degrees;
    }
}

} // namespace
} // namespace penwick::test
