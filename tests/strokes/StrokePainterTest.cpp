// SPDX-License-Identifier: MIT
// The one way of painting a stroke, on a picture of its own.
#include "strokes/StrokePainter.h"

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"

#include <penwick/platform/BezierPath.h>

#include <gtest/gtest.h>

#include <QColor>
#include <QImage>

#include <algorithm>
#include <memory>
#include <optional>
#include <vector>

namespace penwick::test {
namespace {

using platform::BezierPath;
using platform::Point;

constexpr int side = 60;
constexpr QRect everything { 0, 0, side, side };

/// A stroke that goes through `points`, built segment by segment and round as drawn ones are.
StrokeEntry strokeThrough(
    const std::vector<Point> &points, std::optional<QColor> color, double width = 5.0)
{
    auto path = std::make_shared<BezierPath>();
    path->setLineCapStyle(platform::LineCapStyle::Round);
    path->setLineJoinStyle(platform::LineJoinStyle::Round);
    path->setLineWidth(width);
    for (std::size_t index = 1; index < points.size(); ++index) {
        path->moveToPoint(points[index - 1]);
        path->lineToPoint(points[index]);
    }
    const std::int64_t id = path->hash();
    return { path, { points.back(), std::nullopt, color }, id };
}

EntryList<StrokeEntry> listOf(const std::vector<StrokeEntry> &strokes)
{
    EntryList<StrokeEntry> list;
    for (const StrokeEntry &entry : strokes)
        list.append(entry);
    return list;
}

/// `strokes` painted as a canvas paints them, on nothing; only inside `part`.
QImage painted(const std::vector<StrokeEntry> &strokes, const QRect &part = everything)
{
    PixelLayer layer(everything.size());
    CoverageMask scratch;
    const EntryList<StrokeEntry> list = listOf(strokes);
    for (int index = 0; index < list.size(); ++index)
        paintStroke(layer, list[index], colorOf(list, index), 1.0, part, scratch);
    return layer.image();
}

QImage nothing()
{
    return PixelLayer(everything.size()).image();
}

QColor at(const QImage &picture, int x, int y)
{
    return picture.pixelColor(x, side - 1 - y);
}

TEST(StrokePainter, nothingIsPaintedWithoutStrokesOrForAStrokeWithoutSegments)
{
    EXPECT_EQ(painted({}), nothing());
    EXPECT_EQ(painted({ strokeThrough({ { 30, 30 } }, Qt::black) }), nothing());
}

TEST(StrokePainter, strokeHasItsColourItsWidthAndRoundEnds)
{
    const QImage picture = painted({ strokeThrough({ { 20, 30.5 }, { 40, 30.5 } }, Qt::red) });

    for (int y = 28; y <= 32; ++y)
        EXPECT_EQ(at(picture, 30, y), QColor(Qt::red)) << y;
    EXPECT_EQ(at(picture, 30, 27), QColor(Qt::transparent));
    EXPECT_EQ(at(picture, 30, 33), QColor(Qt::transparent));
    EXPECT_EQ(at(picture, 18, 30), QColor(Qt::red));
    EXPECT_EQ(at(picture, 16, 30), QColor(Qt::transparent));
    EXPECT_NE(at(picture, 17, 28), QColor(Qt::red));
}

TEST(StrokePainter, strokeWithoutAColourTakesThatOfTheStrokeBeforeIt)
{
    const QImage picture = painted({ strokeThrough({ { 10, 10.5 }, { 50, 10.5 } }, Qt::green),
        strokeThrough({ { 10, 30.5 }, { 50, 30.5 } }, std::nullopt) });

    EXPECT_EQ(at(picture, 30, 30), QColor(Qt::green));
}

TEST(StrokePainter, firstStrokeIsBlackIfItHasNoColour)
{
    const QImage picture = painted({ strokeThrough({ { 10, 10.5 }, { 50, 10.5 } }, std::nullopt) });

    EXPECT_EQ(at(picture, 30, 10), QColor(Qt::black));
}

TEST(StrokePainter, strokeWithoutAColourTakesThatOfTheStrokeBeforeItThoughThatIsNotPainted)
{
    const QImage picture
        = painted({ strokeThrough({ { 10, 10.5 }, { 50, 10.5 } }, Qt::green),
                      strokeThrough({ { 10, 30.5 }, { 50, 30.5 } }, std::nullopt) },
            { 0, 20, side, side - 20 });

    EXPECT_EQ(at(picture, 30, 10), QColor(Qt::transparent));
    EXPECT_EQ(at(picture, 30, 30), QColor(Qt::green));
}

TEST(StrokePainter, transparentStrokeIsOneShapeAndBlendedOnce)
{
    const QColor half(0, 0, 0, 128);
    const QImage picture = painted({ strokeThrough(
        { { 10, 10 }, { 50, 50 }, { 10, 50 }, { 50, 10 }, { 30, 30 }, { 30, 31 } }, half, 9.0) });

    for (int y = 0; y < side; ++y) {
        for (int x = 0; x < side; ++x)
            EXPECT_LE(at(picture, x, y).alpha(), 128);
    }
    EXPECT_EQ(at(picture, 30, 30).alpha(), 128);
}

TEST(StrokePainter, eachStrokeIsBlendedByItself)
{
    const QColor half(0, 0, 0, 128);
    const QImage picture = painted({ strokeThrough({ { 10, 30 }, { 50, 30 } }, half, 9.0),
        strokeThrough({ { 30, 10 }, { 30, 50 } }, half, 9.0) });

    EXPECT_EQ(at(picture, 20, 30).alpha(), 128);
    EXPECT_EQ(at(picture, 30, 30).alpha(), 192); // 128 + 128 * (1 - 128 / 255)
}

TEST(StrokePainter, segmentThatLeadsNowhereIsADot)
{
    const QImage picture
        = painted({ strokeThrough({ { 30.5, 30.5 }, { 30.5, 30.5 } }, Qt::black, 9.0) });

    for (int x = 27; x <= 33; ++x)
        EXPECT_EQ(at(picture, x, 30), QColor(Qt::black)) << x;
    EXPECT_EQ(at(picture, 25, 30), QColor(Qt::transparent));
    EXPECT_EQ(at(picture, 35, 30), QColor(Qt::transparent));
}

TEST(StrokePainter, curveIsPaintedToo)
{
    auto path = std::make_shared<BezierPath>();
    path->setLineWidth(5.0);
    path->moveToPoint({ 10, 10 });
    path->curveToPoint({ 50, 10 }, { 10, 50 }, { 50, 50 });
    const std::int64_t id = path->hash();

    const QImage picture = painted({ { path, { std::nullopt, std::nullopt, Qt::black }, id } });

    EXPECT_EQ(at(picture, 30, 40), QColor(Qt::black)); // its top: a quarter of 10 + 50 + 50 + 10
    EXPECT_EQ(at(picture, 30, 10), QColor(Qt::transparent)); // no line from end to end
}

TEST(StrokePainter, partIsPixelForPixelWhatTheWholeHasThere)
{
    const std::vector<StrokeEntry> strokes {
        strokeThrough(
            { { 5, 5 }, { 55, 20 }, { 8, 33 }, { 52, 48 }, { 52, 48 } }, QColor(0, 0, 0, 178)),
        strokeThrough({ { 50, 2 }, { 3, 51 } }, QColor(200, 0, 0, 178), 11.0),
    };
    const QImage whole = painted(strokes);

    for (int x = 0; x < side; x += 7) {
        for (int y = 0; y < side; y += 7) {
            const QRect part(x, y, std::min(7, side - x), std::min(7, side - y));
            const QRect shown(x, side - y - part.height(), part.width(), part.height());
            ASSERT_EQ(painted(strokes, part).copy(shown), whole.copy(shown)) << x << ' ' << y;
        }
    }
}

TEST(StrokePainter, strokeWithoutThicknessLeavesNoMark)
{
    EXPECT_EQ(painted({ strokeThrough({ { 10, 10 }, { 50, 50 } }, Qt::black, 0.0) }), nothing());
    EXPECT_EQ(painted({ strokeThrough({ { 10, 10 }, { 50, 50 } }, Qt::black, -3.0) }), nothing());
}

TEST(StrokePainter, pointsAreAsManyPixelsAsTheScaleSays)
{
    PixelLayer layer({ 100, 40 });
    CoverageMask scratch;
    const StrokeEntry stroke = strokeThrough({ { 10, 10 }, { 40, 10 } }, Qt::black, 4.0);
    EXPECT_EQ(pixelsOf(stroke, 2.0), QRect(15, 15, 70, 10));

    paintStroke(layer, stroke, Qt::black, 2.0, layer.area(), scratch);

    const QImage &picture = layer.image();
    EXPECT_EQ(picture.pixelColor(50, 39 - 16), QColor(Qt::black));
    EXPECT_EQ(picture.pixelColor(50, 39 - 23), QColor(Qt::black));
    EXPECT_EQ(picture.pixelColor(50, 39 - 15), QColor(Qt::transparent));
    EXPECT_EQ(picture.pixelColor(50, 39 - 24), QColor(Qt::transparent));
}

} // namespace
} // namespace penwick::test
