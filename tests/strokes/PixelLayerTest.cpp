// SPDX-License-Identifier: MIT
// Layers with rows counted upwards, and colour laid over them.
#include "strokes/PixelLayer.h"

#include "strokes/CoverageMask.h"

#include <gtest/gtest.h>

#include <QColor>

#include <cmath>

namespace penwick::test {
namespace {

constexpr QRect whole { 0, 0, 20, 10 };

/// A mask over `whole` that covers its lower half and one pixel partly.
CoverageMask lowerHalf()
{
    CoverageMask mask;
    mask.reset(whole);
    mask.addCapsule({ -50, -45 }, { 70, -45 }, 50.5); // up to half of row 5
    return mask;
}

TEST(PixelLayer, newLayerIsTransparent)
{
    const PixelLayer layer(whole.size());
    EXPECT_EQ(layer.area(), whole);
    EXPECT_EQ(layer.image().pixel(0, 0), 0U);
    EXPECT_EQ(layer.image().pixel(19, 9), 0U);
}

TEST(PixelLayer, lowestRowIsTheLastLineOfTheImage)
{
    PixelLayer layer(whole.size());
    layer.blend(lowerHalf(), Qt::red, { 3, 0, 1, 1 });

    EXPECT_EQ(layer.image().pixelColor(3, 9), QColor(Qt::red));
    EXPECT_EQ(layer.image().pixelColor(3, 8), QColor(Qt::transparent));
    EXPECT_EQ(layer.inImage({ 3, 0, 2, 4 }), QRect(3, 6, 2, 4));
}

TEST(PixelLayer, colourIsLaidOnAsFarAsTheMaskCoversAndOnlyInTheArea)
{
    PixelLayer layer(whole.size());
    layer.blend(lowerHalf(), QColor(255, 0, 0, 200), { 0, 0, 10, 10 });

    EXPECT_EQ(qAlpha(layer.image().pixel(5, 9 - 4)), 200);
    EXPECT_EQ(qAlpha(layer.image().pixel(5, 9 - 5)), 100); // half of 200, nearly
    EXPECT_EQ(qAlpha(layer.image().pixel(5, 9 - 6)), 0);
    EXPECT_EQ(qAlpha(layer.image().pixel(10, 9 - 4)), 0);
}

TEST(PixelLayer, everyPairOfAlphasBlendsToTheNearestWholeNumberOrTheNextOne)
{
    const CoverageMask mask = lowerHalf();
    for (int below = 0; below <= 255; below += 5) {
        for (int ink = 0; ink <= 255; ink += 3) {
            PixelLayer layer({ 1, 1 });
            layer.blend(mask, QColor(10, 200, 90, below), { 0, 0, 1, 1 });
            layer.blend(mask, QColor(250, 20, 0, ink), { 0, 0, 1, 1 });
            const double alpha = ink + below * (255 - ink) / 255.0;
            ASSERT_NEAR(qAlpha(layer.image().pixel(0, 0)), alpha, 1.0) << below << ' ' << ink;
        }
    }
}

TEST(PixelLayer, clearedAreaIsTransparentAndTheRestStays)
{
    PixelLayer layer(whole.size());
    layer.blend(lowerHalf(), Qt::red, whole);

    layer.clear({ 2, 1, 3, 2 });

    EXPECT_EQ(qAlpha(layer.image().pixel(2, 9 - 1)), 0);
    EXPECT_EQ(qAlpha(layer.image().pixel(4, 9 - 2)), 0);
    EXPECT_EQ(qAlpha(layer.image().pixel(5, 9 - 2)), 255);
    EXPECT_EQ(qAlpha(layer.image().pixel(4, 9 - 3)), 255);
}

TEST(PixelLayer, copyTakesWhatBothHaveFromTheBottomLeftOn)
{
    PixelLayer source(whole.size());
    source.blend(lowerHalf(), Qt::red, whole);
    PixelLayer taller({ 30, 40 });

    taller.copy(source, { 0, 0, 30, 40 });

    EXPECT_EQ(taller.image().pixelColor(0, 39), QColor(Qt::red));
    EXPECT_EQ(taller.image().pixelColor(19, 39 - 4), QColor(Qt::red));
    EXPECT_EQ(taller.image().pixelColor(20, 39), QColor(Qt::transparent));
    EXPECT_EQ(taller.image().pixelColor(0, 39 - 9), QColor(Qt::transparent));

    PixelLayer part(whole.size());
    part.copy(source, { 1, 1, 2, 2 });
    EXPECT_EQ(part.image().pixelColor(1, 9 - 1), QColor(Qt::red));
    EXPECT_EQ(part.image().pixelColor(3, 9 - 1), QColor(Qt::transparent));
    EXPECT_EQ(part.image().pixelColor(1, 9), QColor(Qt::transparent));
}

} // namespace
} // namespace penwick::test
