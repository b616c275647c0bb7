// SPDX-License-Identifier: MIT
// A layer's pixels.
#include "platform/view/Layer.h"

#include <QImage>
#include <QPainter>

#include <gtest/gtest.h>

#include <functional>

namespace penwick::platform {

namespace {

constexpr QColor green { 0, 255, 0 };
const QRectF area(0.0, 0.0, 20.0, 12.0);

QImage painted(double scale, const std::function<void(QPainter &)> &paint)
{
    QImage image((area.size() * scale).toSize(), QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(scale);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    paint(painter);
    return image;
}

/// The number of pixels with each of the properties of a border of `width` pixels.
struct Pixels
{
    int full = 0; // alpha as set, inside the border's width
    int empty = 0; // alpha 0, inside of the border
    int wrong = 0;

    friend bool operator==(const Pixels &, const Pixels &) = default;
};

Pixels counted(const QImage &image, int width, int alpha)
{
    Pixels pixels;
    const QRect inside = image.rect().adjusted(width, width, -width, -width);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const int found = qAlpha(image.pixel(x, y));
            if (inside.contains(x, y))
                ++(found == 0 ? pixels.empty : pixels.wrong);
            else
                ++(found == alpha ? pixels.full : pixels.wrong);
        }
    }
    return pixels;
}

} // namespace

TEST(Layer, newOneShowsNothing)
{
    const Layer layer;

    const QImage image = painted(1.0, [&](QPainter &painter) {
        layer.paintBackground(painter, area);
        layer.paintBorder(painter, area);
    });

    EXPECT_EQ(counted(image, 0, 0), (Pixels { 0, 240, 0 }));
}

TEST(Layer, borderLiesInsideTheBoundsAndFillsItsWidth)
{
    const Layer layer { Qt::transparent, green, 3.0, 0.0 };

    const QImage image = painted(1.0, [&](QPainter &painter) { layer.paintBorder(painter, area); });

    EXPECT_EQ(counted(image, 3, 255), (Pixels { 156, 84, 0 }));
}

TEST(Layer, borderOfTwoPixelsAPointIsSharp)
{
    const Layer layer { Qt::transparent, green, 3.0, 0.0 };

    const QImage image = painted(2.0, [&](QPainter &painter) { layer.paintBorder(painter, area); });

    EXPECT_EQ(counted(image, 6, 255), (Pixels { 624, 336, 0 }));
}

TEST(Layer, translucentBorderIsNowhereDarkerThanItsColour)
{
    const Layer layer { Qt::transparent, QColor(0, 255, 0, 77), 3.0, 0.0 };

    const QImage image = painted(1.0, [&](QPainter &painter) { layer.paintBorder(painter, area); });

    EXPECT_EQ(counted(image, 3, 77), (Pixels { 156, 84, 0 }));
}

TEST(Layer, partInsideOfTheBorderHasNothingOfIt)
{
    const QRectF bounds(0.0, 0.0, 100.0, 60.0);
    Layer layer { Qt::transparent, green, 3.0, 0.0 };

    EXPECT_TRUE(layer.hasBorderIn(bounds, bounds));
    EXPECT_TRUE(layer.hasBorderIn({ 2.0, 30.0, 5.0, 5.0 }, bounds));
    EXPECT_TRUE(layer.hasBorderIn({ 50.0, 54.0, 5.0, 5.0 }, bounds));
    EXPECT_FALSE(layer.hasBorderIn({ 4.0, 4.0, 92.0, 52.0 }, bounds));
    layer.cornerRadius = 10.0; // rounds the corners, and so reaches farther in
    EXPECT_TRUE(layer.hasBorderIn({ 4.0, 4.0, 5.0, 5.0 }, bounds));
    EXPECT_FALSE(layer.hasBorderIn({ 11.0, 11.0, 5.0, 5.0 }, bounds));
    const QRectF small(0.0, 0.0, 12.0, 12.0); // nothing of it is inside
    EXPECT_TRUE(layer.hasBorderIn({ 5.0, 5.0, 2.0, 2.0 }, small));
    layer.borderWidth = 0.0;
    EXPECT_FALSE(layer.hasBorderIn(bounds, bounds));
}

TEST(Layer, backgroundFillsTheBounds)
{
    const Layer layer { green, Qt::black, 0.0, 0.0 };

    const QImage image
        = painted(1.0, [&](QPainter &painter) { layer.paintBackground(painter, area); });

    EXPECT_EQ(counted(image, 10, 255), (Pixels { 240, 0, 0 }));
}

TEST(Layer, cornerRadiusRoundsBackgroundAndBorder)
{
    const Layer layer { green, green, 1.0, 4.0 };

    const QImage image = painted(1.0, [&](QPainter &painter) {
        layer.paintBackground(painter, area);
        layer.paintBorder(painter, area);
    });

    EXPECT_LT(qAlpha(image.pixel(0, 0)), 64);
    EXPECT_LT(qAlpha(image.pixel(19, 11)), 64);
    EXPECT_EQ(qAlpha(image.pixel(4, 0)), 255);
    EXPECT_EQ(qAlpha(image.pixel(10, 6)), 255);
}

} // namespace penwick::platform
