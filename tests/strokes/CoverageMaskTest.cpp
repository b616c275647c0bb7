// SPDX-License-Identifier: MIT
// Coverage against a finely sampled reference; and that order, repetition and division do not
// matter.
#include "strokes/CoverageMask.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <vector>

namespace penwick::test {
namespace {

using platform::Point;

constexpr QRect area { -8, -4, 64, 48 };

struct Line
{
    Point from;
    Point to;
};

/// What a mask over `part` of the area holds there after `lines`.
std::vector<int> coverageOf(const std::vector<Line> &lines, double radius, const QRect &part = area)
{
    CoverageMask mask;
    mask.reset(part);
    for (const Line &line : lines)
        mask.addCapsule(line.from, line.to, radius);
    std::vector<int> coverage;
    for (int y = part.y(); y <= part.bottom(); ++y) {
        const auto row = mask.row(part.x(), y, part.width());
        coverage.insert(coverage.end(), row.begin(), row.end());
    }
    return coverage;
}

double distanceFrom(const Line &line, Point point)
{
    const Point direction = line.to - line.from;
    const Point away = point - line.from;
    const double squared = direction.x * direction.x + direction.y * direction.y;
    const double part = squared > 0.0
        ? std::clamp((away.x * direction.x + away.y * direction.y) / squared, 0.0, 1.0)
        : 0.0;
    return std::hypot(away.x - part * direction.x, away.y - part * direction.y);
}

/// The share of the pixel at (x, y) that `line` covers, by asking 64 by 64 places in it.
double sampled(const Line &line, double radius, int x, int y)
{
    constexpr double diagonal = 1.42;
    const double fromCenter = distanceFrom(line, { x + 0.5, y + 0.5 }) - radius;
    if (std::abs(fromCenter) > diagonal / 2)
        return fromCenter < 0.0 ? 1.0 : 0.0;
    constexpr int samples = 64;
    int inside = 0;
    for (int row = 0; row < samples; ++row) {
        for (int column = 0; column < samples; ++column) {
            const Point place { x + (column + 0.5) / samples, y + (row + 0.5) / samples };
            inside += distanceFrom(line, place) <= radius ? 1 : 0;
        }
    }
    return static_cast<double>(inside) / (samples * samples);
}

/// Of all pixels that an edge crosses, the mean and the largest difference from what was sampled.
struct Errors
{
    int crossed = 0;
    double mean = 0.0;
    double largest = 0.0;
};

Errors errorsOf(const Line &line, double radius)
{
    const std::vector<int> coverage = coverageOf({ line }, radius);
    double sum = 0.0;
    double largest = 0.0;
    int crossed = 0;
    for (int y = area.y(); y <= area.bottom(); ++y) {
        for (int x = area.x(); x <= area.right(); ++x) {
            const double expected = sampled(line, radius, x, y);
            const auto place
                = static_cast<std::size_t>((y - area.y()) * area.width() + x - area.x());
            const double difference = std::abs(coverage[place] / 255.0 - expected);
            if ((expected > 0.0 && expected < 1.0) || difference > 0.0)
                ++crossed;
            sum += difference;
            largest = std::max(largest, difference);
        }
    }
    return { crossed, crossed > 0 ? sum / crossed : 0.0, largest };
}

double anyCoordinate()
{
    return *rc::gen::inRange(-20 * 16, 70 * 16) / 16.0;
}

Line anyLine()
{
    const Point from { anyCoordinate(), anyCoordinate() };
    switch (*rc::gen::inRange(0, 4)) {
    case 0:
        return { from, from };
    case 1:
        return { from, { anyCoordinate(), anyCoordinate() } };
    default:
        return { from,
            { from.x + *rc::gen::inRange(-80, 81) / 16.0,
                from.y + *rc::gen::inRange(-80, 81) / 16.0 } };
    }
}

double anyRadius()
{
    return *rc::gen::inRange(4, 320) / 16.0;
}

TEST(CoverageMask, nothingIsCoveredAtFirst)
{
    const std::vector<int> coverage = coverageOf({}, 5.0);
    EXPECT_TRUE(std::ranges::all_of(coverage, [](int covered) { return covered == 0; }));
}

TEST(CoverageMask, edgeAlongThePixelsIsSharpAndOneInTheMiddleOfAPixelCoversHalfOfIt)
{
    CoverageMask mask;
    mask.reset(area);
    mask.addCapsule({ 0, 10 }, { 40, 10 }, 2.5);

    EXPECT_EQ(mask.row(20, 6, 1)[0], 0);
    EXPECT_EQ(mask.row(20, 7, 1)[0], 127);
    EXPECT_EQ(mask.row(20, 8, 1)[0], 255);
    EXPECT_EQ(mask.row(20, 11, 1)[0], 255);
    EXPECT_EQ(mask.row(20, 12, 1)[0], 127);
    EXPECT_EQ(mask.row(20, 13, 1)[0], 0);
}

TEST(CoverageMask, lineThinnerThanAPixelCoversItsShareOfIt)
{
    CoverageMask mask;
    mask.reset(area);
    mask.addCapsule({ 0, 10.5 }, { 40, 10.5 }, 0.25);

    EXPECT_EQ(mask.row(20, 9, 1)[0], 0);
    EXPECT_EQ(mask.row(20, 10, 1)[0], 127);
    EXPECT_EQ(mask.row(20, 11, 1)[0], 0);
}

TEST(CoverageMask, clearedPartIsNotCoveredAndTheRestIs)
{
    CoverageMask mask;
    mask.reset(area);
    mask.addCapsule({ 0, 10.5 }, { 40, 10.5 }, 3.0);

    mask.clear({ 10, 0, 5, 20 });

    EXPECT_EQ(mask.row(9, 10, 1)[0], 255);
    EXPECT_EQ(mask.row(10, 10, 1)[0], 0);
    EXPECT_EQ(mask.row(14, 10, 1)[0], 0);
    EXPECT_EQ(mask.row(15, 10, 1)[0], 255);
}

TEST(CoverageMask, lineFromFarAwayIsCutOffWithoutHarm)
{
    const std::vector<int> coverage = coverageOf({ { { -1e300, 20 }, { 1e300, 20 } } }, 4.0);
    EXPECT_EQ(*std::ranges::max_element(coverage), 255);
}

TEST(CoverageMask, hugeRadiusCoversEverything)
{
    for (const double radius : { 1e5, 3e6, 5e9, 1e12, 1e300 }) {
        const std::vector<int> coverage = coverageOf({ { { -3, 20 }, { 30, 10 } } }, radius);
        EXPECT_EQ(*std::ranges::min_element(coverage), 255) << radius;
    }
}

RC_GTEST_PROP(CoverageMaskProperties, everyLineIsCloseToWhatSamplingItFinelyGives, ())
{
    const Line line = anyLine();
    const double radius = std::max(anyRadius(), 0.5);

    const Errors errors = errorsOf(line, radius);

    // The ends of thin lines are the worst: there the edge bends within a pixel.
    RC_ASSERT(errors.largest <= (radius < 1.0 ? 0.35 : 0.16));
    constexpr int many = 60; // then more than a line's ends is inside the area
    if (errors.crossed >= many)
        RC_ASSERT(errors.mean <= 0.01);
}

RC_GTEST_PROP(CoverageMaskProperties, neitherOrderNorRepetitionOfLinesCanBeSeen, ())
{
    std::vector<Line> lines;
    for (int left = *rc::gen::inRange(1, 6); left > 0; --left)
        lines.push_back(anyLine());
    const double radius = anyRadius();
    const std::vector<int> expected = coverageOf(lines, radius);

    std::vector<Line> others(lines.rbegin(), lines.rend());
    others.push_back(*rc::gen::elementOf(lines));

    RC_ASSERT(coverageOf(others, radius) == expected);
}

RC_GTEST_PROP(CoverageMaskProperties, anyPartIsWhatTheWholeHasThere, ())
{
    std::vector<Line> lines;
    for (int left = *rc::gen::inRange(1, 4); left > 0; --left)
        lines.push_back(anyLine());
    const double radius = anyRadius();
    const std::vector<int> whole = coverageOf(lines, radius);
    const QRect part = QRect(*rc::gen::inRange(-8, 50), *rc::gen::inRange(-4, 40),
                           *rc::gen::inRange(1, 40), *rc::gen::inRange(1, 40))
        & area;

    std::vector<int> expected;
    for (int y = part.y(); y <= part.bottom(); ++y) {
        const auto row = static_cast<std::ptrdiff_t>(y - area.y());
        const auto start = whole.begin() + row * area.width() + part.x() - area.x();
        expected.insert(expected.end(), start, start + part.width());
    }

    RC_ASSERT(coverageOf(lines, radius, part) == expected);
}

RC_GTEST_PROP(CoverageMaskProperties, nothingOutsideTheReportedPixelsIsTouched, ())
{
    const Line line = anyLine();
    const double radius = anyRadius();
    CoverageMask mask;
    mask.reset(area);

    const QRect reported = mask.addCapsule(line.from, line.to, radius);

    for (int y = area.y(); y <= area.bottom(); ++y) {
        for (int x = area.x(); x <= area.right(); ++x) {
            if (!reported.contains(x, y))
                RC_ASSERT(mask.row(x, y, 1)[0] == 0);
        }
    }
}

} // namespace
} // namespace penwick::test
