// SPDX-License-Identifier: MIT
// The fonts of a text box by their size.
#include "textbox/TextBoxFont.h"

#include <QFontDatabase>
#include <QFontMetrics>

#include <gtest/gtest.h>

#include <limits>

namespace penwick {

TEST(TextBoxFont, sizeIsInPointsOfTheScreensLogicalPixels)
{
    EXPECT_EQ(systemFontOf(14.0).pixelSize(), 14);
    EXPECT_EQ(textFontOf(24.0).pixelSize(), 24);
    EXPECT_NEAR(QFontMetrics(textFontOf(24.0)).height(), 28, 3);
}

TEST(TextBoxFont, partOfAPointIsRounded)
{
    EXPECT_EQ(textFontOf(24.4).pixelSize(), 24);
    EXPECT_EQ(textFontOf(24.5).pixelSize(), 25);
}

TEST(TextBoxFont, sizeThatNoLineCanHaveIsTheNearestThatItCan)
{
    EXPECT_EQ(textFontOf(0.0).pixelSize(), 1);
    EXPECT_EQ(textFontOf(-5.0).pixelSize(), 1);
    EXPECT_EQ(textFontOf(1e300).pixelSize(), 1000);
    EXPECT_EQ(textFontOf(std::numeric_limits<double>::infinity()).pixelSize(), 1000);
}

TEST(TextBoxFont, isTheSystemsWhereThePreferredOneIsNotInstalled)
{
    ASSERT_FALSE(QFontDatabase::hasFamily(QStringLiteral("ProximaNova-Regular")));

    EXPECT_EQ(
        textFontOf(24.0).family(), QFontDatabase::systemFont(QFontDatabase::GeneralFont).family());
}

} // namespace penwick
