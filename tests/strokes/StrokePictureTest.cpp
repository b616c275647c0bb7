// SPDX-License-Identifier: MIT
// Mended pixels against painting everything anew.
#include "strokes/StrokePicture.h"

#include "StrokeFixture.h"
#include "strokes/StrokeIndex.h"
#include "strokes/StrokePainter.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <QImage>

#include <optional>
#include <string>
#include <vector>

namespace penwick::test {
namespace {

/// Every stroke, oldest first, on nothing.
QImage paintedAnew(const EntryList<StrokeEntry> &strokes, QSize size, double scale)
{
    PixelLayer layer(size);
    CoverageMask scratch;
    for (int index = 0; index < strokes.size(); ++index)
        paintStroke(layer, strokes[index], colorOf(strokes, index), scale, layer.area(), scratch);
    return layer.image();
}

/// A picture with an index of the same strokes.
class Shown
{
public:
    void follow(const EntryList<StrokeEntry> &strokes)
    {
        m_index.follow(strokes);
        m_picture.follow(strokes);
    }
    void update(QSize size, double scale) { m_picture.update(m_index, size, scale); }
    [[nodiscard]] const PixelLayer &pixels() const { return m_picture.pixels(); }

private:
    StrokeIndex m_index;
    StrokePicture m_picture;
};

QImage imageOf(const Shown &picture, QSize size)
{
    if (picture.pixels().area().isEmpty())
        return PixelLayer(size).image();
    return picture.pixels().image().copy(picture.pixels().inImage({ QPoint(), size }));
}

/// A horizontal stroke, of the colour before it if it has none.
StrokeEntry coloredLineAt(double y, const std::optional<QColor> &color)
{
    StrokeEntry stroke = lineAt(y);
    stroke.bPathParams.pathColor = color;
    return stroke;
}

EntryList<StrokeEntry> listOf(const std::vector<StrokeEntry> &strokes)
{
    EntryList<StrokeEntry> list;
    for (const StrokeEntry &stroke : strokes)
        list.append(stroke);
    return list;
}

/// What the middle of a line at `y` shows after `before` was painted and then gave way to `after`.
std::string colorAt(
    int y, const std::vector<StrokeEntry> &before, const std::vector<StrokeEntry> &after)
{
    Shown picture;
    for (const auto &strokes : { before, after }) {
        picture.follow(listOf(strokes));
        picture.update({ 100, 70 }, 1.0);
    }
    const PixelLayer &pixels = picture.pixels();
    const QRect place = pixels.inImage({ 30, y, 1, 1 });
    return pixels.image().pixelColor(place.topLeft()).name().toStdString();
}

TEST(StrokePicture, olderStrokeWithoutAColourTakesAnotherWhenTheOneBeforeItGoes)
{
    const StrokeEntry green = coloredLineAt(10, Qt::green);
    const StrokeEntry red = coloredLineAt(20, Qt::red);
    const StrokeEntry plain = coloredLineAt(40, std::nullopt);
    const StrokeEntry newest = coloredLineAt(60, Qt::blue);

    EXPECT_EQ(colorAt(40, { green, red, plain, newest }, { green, red, plain, newest }), "#ff0000");
    EXPECT_EQ(colorAt(40, { green, red, plain, newest }, { green, plain, newest }), "#00ff00");
    EXPECT_EQ(colorAt(40, { red, plain, newest }, { plain, newest }), "#000000");
}

TEST(StrokePicture, olderStrokeWithoutAColourTakesTheOneThatComesBackBeforeIt)
{
    const StrokeEntry red = coloredLineAt(20, Qt::red);
    const StrokeEntry plain = coloredLineAt(40, std::nullopt);
    const StrokeEntry newest = coloredLineAt(60, Qt::blue);

    EXPECT_EQ(colorAt(40, { plain, newest }, { red, plain, newest }), "#ff0000");
}

TEST(StrokePicture, newestStrokeWithoutAColourTakesAnotherWhenTheOneBeforeItGoes)
{
    const StrokeEntry red = coloredLineAt(20, Qt::red);
    const StrokeEntry plain = coloredLineAt(40, std::nullopt);

    EXPECT_EQ(colorAt(40, { red, plain }, { plain }), "#000000");
    EXPECT_EQ(colorAt(40, { plain }, { red, plain }), "#ff0000");
}

TEST(StrokePicture, pictureOfNothingHasNoPixelsAndKeepsNone)
{
    Shown picture;
    picture.update({ 100, 70 }, 1.0);
    EXPECT_TRUE(picture.pixels().area().isEmpty());

    EntryList<StrokeEntry> strokes;
    strokes.append(lineAt(10));
    picture.follow(strokes);
    picture.update({ 100, 70 }, 1.0);
    EXPECT_GE(picture.pixels().area().width(), 100);
    EXPECT_GE(picture.pixels().area().height(), 70);

    picture.follow({});
    EXPECT_TRUE(picture.pixels().area().isEmpty());
}

TEST(StrokePicture, strokesThatItsIndexKnowsAlreadyAreNotShownBeforeItIsToldOfThem)
{
    EntryList<StrokeEntry> strokes = listOf({ lineAt(10), lineAt(30) });
    StrokePicture picture;
    picture.follow(strokes);
    StrokeIndex index;
    for (const double y : { 40.0, 50.0 })
        strokes.append(lineAt(y));
    index.follow(strokes);

    picture.update(index, { 100, 70 }, 1.0);

    EXPECT_EQ(picture.pixels().image().copy(picture.pixels().inImage({ 0, 0, 100, 70 })),
        paintedAnew(listOf({ strokes[0], strokes[1] }), { 100, 70 }, 1.0));
}

RC_GTEST_PROP(StrokePictureProperties, mendedPictureIsTheOnePaintedAnew, ())
{
    AnyDrawing drawing;
    Shown picture;
    double scale = 1.0;
    QSize size(side, side);
    const int steps = *rc::gen::inRange(1, 60);
    for (int step = 0; step < steps; ++step) {
        drawing.change();
        picture.follow(drawing.strokes());
        if (*rc::gen::inRange(0, 12) == 0)
            scale = *rc::gen::element(1.0, 1.25, 1.5, 2.0);
        if (*rc::gen::inRange(0, 8) == 0)
            size = { *rc::gen::inRange(1, 300), *rc::gen::inRange(1, 300) };
        if (*rc::gen::inRange(0, 2) == 0) {
            picture.update(size, scale);
            RC_ASSERT(imageOf(picture, size) == paintedAnew(drawing.strokes(), size, scale));
        }
    }
}

} // namespace
} // namespace penwick::test
