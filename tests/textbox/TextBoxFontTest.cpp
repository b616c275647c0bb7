// SPDX-License-Identifier: MIT
// The fonts of a text box by their size.
#include "textbox/TextBoxFont.h"

#include <QFontDatabase>
#include <QFontInfo>
#include <QFontMetrics>

#include <gtest/gtest.h>

#include <limits>

namespace penwick::test {

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

TEST(TextBoxFont, faceIsFoundByItsNameWithoutSpaces)
{
    const auto bold = fontNamed(QStringLiteral("DejaVuSans-Bold"), 24.0);
    const auto oblique = fontNamed(QStringLiteral("DejaVuSansMono-BoldOblique"), 18.0);

    ASSERT_TRUE(bold);
    EXPECT_EQ(QFontInfo(*bold).family(), QStringLiteral("DejaVu Sans"));
    EXPECT_TRUE(QFontInfo(*bold).bold());
    EXPECT_FALSE(QFontInfo(*bold).italic());
    EXPECT_EQ(bold->pixelSize(), 24);
    ASSERT_TRUE(oblique);
    EXPECT_EQ(QFontInfo(*oblique).family(), QStringLiteral("DejaVu Sans Mono"));
    EXPECT_TRUE(QFontInfo(*oblique).bold());
    EXPECT_TRUE(QFontInfo(*oblique).italic());
    EXPECT_EQ(oblique->pixelSize(), 18);
}

TEST(TextBoxFont, faceIsItselfAndNoOtherOfItsFamily)
{
    const auto book = fontNamed(QStringLiteral("DejaVuSans-Book"), 24.0);

    ASSERT_TRUE(book);
    EXPECT_FALSE(QFontInfo(*book).bold());
    EXPECT_EQ(QFontInfo(*book).family(), QStringLiteral("DejaVu Sans"));
}

TEST(TextBoxFont, nameOfNoInstalledFaceFindsNone)
{
    for (const char *const name :
        { "DejaVuSans-Fat", "DejaVuSan-Bold", "DejaVuSanss-Bold", "DejaVu Sans-Bold",
            "DejaVuSans-Bol", "DejaVuSans-Boldd", "DejaVuSans", "-Bold", "-", "DejaVuSans-", "" })
        EXPECT_FALSE(fontNamed(QString::fromLatin1(name), 24.0)) << name;
}

TEST(TextBoxFont, isTheSystemsWhereThePreferredOneIsNotInstalled)
{
    ASSERT_FALSE(fontNamed(QStringLiteral("ProximaNova-Regular"), 24.0));

    EXPECT_EQ(
        textFontOf(24.0).family(), QFontDatabase::systemFont(QFontDatabase::GeneralFont).family());
}

} // namespace penwick::test
