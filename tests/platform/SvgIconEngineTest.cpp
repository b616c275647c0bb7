// SPDX-License-Identifier: MIT
// Artwork is rendered for the pixels it is asked for.
#include "platform/scene/SvgIconEngine.h"

#include "platform/SvgFile.h"

#include <QImage>
#include <QPixmap>

#include <gtest/gtest.h>

#include <cmath>

namespace penwick::platform {

namespace {

class SvgIconScale : public testing::TestWithParam<double>
{ };

/// Columns of `image` that are red at every pixel, and those that are empty; any other is blurred.
struct Columns
{
    int red = 0;
    int empty = 0;
    int blurred = 0;

    friend bool operator==(const Columns &, const Columns &) = default;
};

Columns columns(const QImage &image)
{
    Columns found;
    for (int x = 0; x < image.width(); ++x) {
        int red = 0;
        int empty = 0;
        for (int y = 0; y < image.height(); ++y) {
            red += image.pixel(x, y) == qRgba(255, 0, 0, 255);
            empty += qAlpha(image.pixel(x, y)) == 0;
        }
        found.red += red == image.height();
        found.empty += empty == image.height();
        found.blurred += red != image.height() && empty != image.height();
    }
    return found;
}

} // namespace

TEST_P(SvgIconScale, pixmapHasEveryPixelOfItsScale)
{
    const SvgFile artwork(20, 10);
    const double scale = GetParam();

    const QPixmap pixmap = artwork.icon().pixmap(QSize(20, 10), scale);

    EXPECT_EQ(pixmap.size(), QSize(20, 10) * scale);
    EXPECT_EQ(pixmap.devicePixelRatio(), scale);
    const int half = static_cast<int>(std::lround(10 * scale));
    EXPECT_EQ(columns(pixmap.toImage()), (Columns { half, half, 0 }));
}

INSTANTIATE_TEST_SUITE_P(SvgIconEngine, SvgIconScale, testing::Values(1.0, 1.5, 2.0),
    [](const auto &scale) { return "at" + std::to_string(std::lround(scale.param * 100)); });

TEST(SvgIconEngine, ownSizeIsTheArtworks)
{
    const SvgFile artwork(20, 10);

    EXPECT_EQ(artwork.icon().actualSize(QSize(128, 128)), QSize(20, 10));
}

TEST(SvgIconEngine, smallerSizeKeepsTheShape)
{
    const SvgFile artwork(20, 10);

    EXPECT_EQ(artwork.icon().actualSize(QSize(10, 10)), QSize(10, 5));
}

TEST(SvgIconEngine, disabledImageIsFaint)
{
    const SvgFile artwork(20, 10);

    const QImage image = artwork.icon().pixmap(QSize(20, 10), QIcon::Disabled).toImage();

    EXPECT_EQ(image.pixelColor(5, 5).red(), 255);
    EXPECT_NEAR(image.pixelColor(5, 5).alphaF(), 0.35, 0.01);
}

TEST(SvgIconEngine, copyOfAnIconShowsTheSame)
{
    const SvgFile artwork(20, 10);
    QIcon copy = artwork.icon();
    copy.addPixmap(QPixmap()); // makes it take an engine of its own

    EXPECT_EQ(columns(copy.pixmap(QSize(20, 10), 1.0).toImage()), (Columns { 10, 10, 0 }));
}

} // namespace penwick::platform
