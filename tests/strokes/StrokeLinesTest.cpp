// SPDX-License-Identifier: MIT
// The straight lines that stand for a path.
#include "strokes/StrokeLines.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace penwick::test {

namespace {

using platform::BezierPath;
using platform::Point;

double distanceTo(const StrokeLine &line, Point point)
{
    const Point way = line.to - line.from;
    const Point offset = point - line.from;
    const double square = way.x * way.x + way.y * way.y;
    const double part
        = square > 0 ? std::clamp((offset.x * way.x + offset.y * way.y) / square, 0.0, 1.0) : 0.0;
    return std::hypot(offset.x - way.x * part, offset.y - way.y * part);
}

/// How far the curve gets from the lines that stand for it.
double largestDistance(
    const std::vector<StrokeLine> &lines, Point start, Point control1, Point control2, Point end)
{
    constexpr int samples = 2000;
    double largest = 0.0;
    for (int sample = 0; sample <= samples; ++sample) {
        const double t = static_cast<double>(sample) / samples;
        const double s = 1 - t;
        const auto at = [&](double a, double b, double c, double d) {
            return s * s * s * a + 3 * s * s * t * b + 3 * s * t * t * c + t * t * t * d;
        };
        const Point point { at(start.x, control1.x, control2.x, end.x),
            at(start.y, control1.y, control2.y, end.y) };
        double nearest = 1e9;
        for (const StrokeLine &line : lines)
            nearest = std::min(nearest, distanceTo(line, point));
        largest = std::max(largest, nearest);
    }
    return largest;
}

} // namespace

TEST(StrokeLines, movesMakeNoLineAndClosingGoesBackToTheLastMove)
{
    BezierPath path;
    path.moveToPoint({ 1, 2 });
    path.lineToPoint({ 5, 2 });
    path.moveToPoint({ 10, 10 });
    path.lineToPoint({ 20, 10 });
    path.lineToPoint({ 20, 30 });
    path.closePath();
    path.lineToPoint({ 0, 0 });

    const std::vector<StrokeLine> lines = linesOf(path);

    ASSERT_EQ(lines.size(), 5U);
    const std::vector<StrokeLine> expected { { { 1, 2 }, { 5, 2 } }, { { 10, 10 }, { 20, 10 } },
        { { 20, 10 }, { 20, 30 } }, { { 20, 30 }, { 10, 10 } }, { { 10, 10 }, { 0, 0 } } };
    for (std::size_t index = 0; index < lines.size(); ++index) {
        EXPECT_TRUE(lines[index].from == expected[index].from) << index;
        EXPECT_TRUE(lines[index].to == expected[index].to) << index;
    }
}

TEST(StrokeLines, curveIsNowhereFartherThanAHundredthOfAPointFromItsChordsAndTheyAreNotTooMany)
{
    struct Curve
    {
        Point control1;
        Point control2;
        Point end;
    };
    for (const Curve &curve : { Curve { { 0, 100 }, { 100, 100 }, { 100, 0 } },
             Curve { { 300, 0 }, { -200, 0 }, { 100, 0 } },
             Curve { { 0, 0 }, { 0, 80 }, { 80, 80 } },
             Curve { { 120, 40 }, { 20, 150 }, { 20, 150 } } }) {
        BezierPath path;
        path.moveToPoint({ 0, 0 });
        path.curveToPoint(curve.end, curve.control1, curve.control2);
        path.lineToPoint({ 7, 7 });

        std::vector<StrokeLine> lines = linesOf(path);

        EXPECT_TRUE(lines.back().from == curve.end);
        lines.pop_back();
        EXPECT_TRUE(lines.front().from == (Point { 0, 0 }));
        for (std::size_t index = 1; index < lines.size(); ++index)
            EXPECT_TRUE(lines[index].from == lines[index - 1].to) << index;
        EXPECT_TRUE(lines.back().to == curve.end);
        const auto distance = [&](const std::vector<StrokeLine> &chords) {
            return largestDistance(chords, { 0, 0 }, curve.control1, curve.control2, curve.end);
        };
        EXPECT_LE(distance(lines), 0.01);
        EXPECT_GT(lines.size(), 20U);
        EXPECT_LT(lines.size(), 250U);
    }
}

TEST(StrokeLines, curveThatIsStraightIsOneLine)
{
    BezierPath path;
    path.moveToPoint({ 0, 0 });
    path.curveToPoint({ 30, 30 }, { 10, 10 }, { 20, 20 });

    const std::vector<StrokeLine> lines = linesOf(path);

    ASSERT_EQ(lines.size(), 1U);
    EXPECT_TRUE(lines.front().to == (Point { 30, 30 }));
}

TEST(StrokeLines, curveOfAnySizeHasNoMoreThanTenThousandChords)
{
    BezierPath path;
    path.moveToPoint({ 0, 0 });
    path.curveToPoint({ 1e12, 0 }, { 0, 1e12 }, { 1e12, 1e12 });

    EXPECT_EQ(linesOf(path).size(), 10'000U);
}

} // namespace penwick::test
