// SPDX-License-Identifier: MIT
// Every constant of the look, value by value.
#include "appearance/Theme.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <ostream>
#include <string>
#include <vector>

namespace penwick::test {

namespace {

struct NamedColor
{
    std::string name;
    QColor color;
    int red;
    int green;
    int blue;
    int opacity; // in tenths

    friend std::ostream &operator<<(std::ostream &stream, const NamedColor &named)
    {
        return stream << named.name;
    }
};

class ThemeColor : public testing::TestWithParam<NamedColor>
{ };

std::string nameOf(const testing::TestParamInfo<NamedColor> &info)
{
    return info.param.name;
}

std::vector<std::string> sortedKeys()
{
    std::vector<std::string> keys;
    for (const QString &key : colorMap().keys())
        keys.push_back(key.toStdString());
    std::sort(keys.begin(), keys.end());
    return keys;
}

} // namespace

TEST_P(ThemeColor, hasItsComponents)
{
    const QColor color = GetParam().color;

    EXPECT_EQ(color.spec(), QColor::Rgb);
    EXPECT_EQ(color.red(), GetParam().red);
    EXPECT_EQ(color.green(), GetParam().green);
    EXPECT_EQ(color.blue(), GetParam().blue);
    // Alpha is kept in 16 bits, so a tenth is not exact; in 8 bits it would be farther off.
    EXPECT_NEAR(color.alphaF(), GetParam().opacity / 10.0, 1.0 / 65535);
}

INSTANTIATE_TEST_SUITE_P(TnhColors, ThemeColor,
    testing::Values(NamedColor { "redColor", TnhColors::redColor, 255, 58, 104, 10 },
        NamedColor { "greenColor", TnhColors::greenColor, 0, 203, 121, 10 },
        NamedColor { "blueColor", TnhColors::blueColor, 20, 120, 199, 10 },
        NamedColor { "whiteColor", TnhColors::whiteColor, 255, 255, 255, 10 },
        NamedColor { "greyColor", TnhColors::greyColor, 77, 103, 128, 10 },
        NamedColor { "blackColor", TnhColors::blackColor, 41, 41, 41, 10 },
        NamedColor { "yellowColor", TnhColors::yellowColor, 255, 196, 61, 10 },
        NamedColor { "lightBlueColor", TnhColors::lightBlueColor, 0, 167, 244, 10 },
        NamedColor { "lightGreyColor", TnhColors::lightGreyColor, 203, 210, 218, 10 },
        NamedColor { "borderGreenColor", TnhColors::borderGreenColor, 0, 255, 0, 3 },
        NamedColor { "endButtonColor", TnhColors::endButtonColor, 239, 71, 111, 10 },
        NamedColor { "endButtonColorHover", TnhColors::endButtonColorHover, 255, 80, 134, 10 },
        NamedColor { "endButtonColorContrast", TnhColors::endButtonColorContrast, 190, 41, 76, 10 },
        NamedColor { "endButtonColorContrastHover", TnhColors::endButtonColorContrastHover, 219, 47,
            87, 10 },
        NamedColor { "toolPanelHandleColor", TnhColors::toolPanelHandleColor, 203, 210, 218, 10 },
        NamedColor { "toolPanelButtonColor", TnhColors::toolPanelButtonColor, 246, 248, 250, 10 },
        NamedColor {
            "toolPanelButtonHoverColor", TnhColors::toolPanelButtonHoverColor, 18, 168, 241, 10 },
        NamedColor { "toolPanelButtonHoverColorContrast",
            TnhColors::toolPanelButtonHoverColorContrast, 7, 69, 149, 10 },
        NamedColor { "textBoxEditBorderColor", TnhColors::textBoxEditBorderColor, 0, 0, 255, 8 },
        NamedColor {
            "textBoxNormalBorderColor", TnhColors::textBoxNormalBorderColor, 0, 0, 255, 4 },
        NamedColor { "toolOptionButtonColor", TnhColors::toolOptionButtonColor, 246, 248, 250, 10 },
        NamedColor { "toolOptionButtonHoverColor", TnhColors::toolOptionButtonHoverColor, 203, 210,
            218, 10 }),
    nameOf);

// The desktop's own grey is half of white; its black is 0.
INSTANTIATE_TEST_SUITE_P(Interface, ThemeColor,
    testing::Values(
        NamedColor { "toolPanelBorderColor", ToolPanelUI::toolPanelBorderColor, 128, 128, 128, 10 },
        NamedColor { "toolPanelColor", ToolPanelUI::toolPanelColor, 246, 248, 250, 10 },
        NamedColor {
            "popoverBackgroundColor", PopoverUI::popoverBackgroundColor, 128, 128, 128, 10 },
        NamedColor { "defaultTextFontColor", TextBoxParams::defaultTextFontColor, 0, 0, 0, 10 }),
    nameOf);

TEST(Theme, toolPanelHasRoundCornersOfFourPoints)
{
    EXPECT_EQ(ToolPanelUI::toolPanelBorderRadius, 4.0);
}

// This compiles only if the colours are constants at compile time, so that loading the library runs
// no code for them.
[[maybe_unused]] constexpr std::array known { TnhColors::borderGreenColor,
    TnhColors::textBoxEditBorderColor, TnhColors::textBoxNormalBorderColor, TnhColors::redColor,
    ToolPanelUI::toolPanelColor, TextBoxParams::defaultTextFontColor };
static_assert(Tools::text.size() == 4 && Tools::brush.size() == 5 && Tools::eraser.size() == 6
    && Tools::color.size() == 5 && Tools::clear.size() == 5 && Tools::state.size() == 5
    && Tools::undo.size() == 4 && Tools::redo.size() == 4
    && Tools::defaultSelectedTool.size() == 4);

TEST(Theme, coloursThatShineThroughAreWhatTheirFractionsGive)
{
    EXPECT_EQ(TnhColors::borderGreenColor, QColor::fromRgbF(0.0F, 1.0F, 0.0F, 0.3F));
    EXPECT_EQ(TnhColors::textBoxEditBorderColor, QColor::fromRgbF(0.0F, 0.0F, 1.0F, 0.8F));
    EXPECT_EQ(TnhColors::textBoxNormalBorderColor, QColor::fromRgbF(0.0F, 0.0F, 1.0F, 0.4F));
}

TEST(Theme, toolAtTheStartIsText)
{
    EXPECT_EQ(Tools::defaultSelectedTool, QStringLiteral("text"));
}

TEST(Theme, hotSpotsAreInPointsOfTheImages)
{
    EXPECT_EQ(CursorHotspot::textCursorHotspot, (platform::Point { 10.0, 10.0 }));
    EXPECT_EQ(CursorHotspot::brushCursorHotspot, (platform::Point { 0.0, 20.0 }));
    EXPECT_EQ(CursorHotspot::eraserCursorHotspot, (platform::Point { 0.0, 20.0 }));
    EXPECT_EQ(CursorHotspot::moveCursorHotspot, (platform::Point { 12.0, 12.0 }));
}

TEST(ColorMap, hasExactlyNineNames)
{
    EXPECT_EQ(sortedKeys(),
        (std::vector<std::string> { "black", "dark_blue", "dark_grey", "green", "light_blue",
            "light_grey", "red", "white", "yellow" }));
}

TEST(ColorMap, namesMeanTheThemesColours)
{
    EXPECT_EQ(colorMap().value(QStringLiteral("black")), TnhColors::blackColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("white")), TnhColors::whiteColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("dark_grey")), TnhColors::greyColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("dark_blue")), TnhColors::blueColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("red")), TnhColors::redColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("green")), TnhColors::greenColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("yellow")), TnhColors::yellowColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("light_grey")), TnhColors::lightGreyColor);
    EXPECT_EQ(colorMap().value(QStringLiteral("light_blue")), TnhColors::lightBlueColor);
}

TEST(ColorMap, isMadeOnce)
{
    EXPECT_EQ(&colorMap(), &colorMap());
}

/// A name that is spelt almost right.
class MisspeltColor : public testing::TestWithParam<const char *>
{ };

TEST_P(MisspeltColor, isNoColour)
{
    EXPECT_FALSE(colorMap().contains(QString::fromLatin1(GetParam())));
}

INSTANTIATE_TEST_SUITE_P(ColorMap, MisspeltColor,
    testing::Values("Black", "RED", "dark_gray", "light_gray", "darkgrey", "darkblue", "lightblue",
        "Light_Blue", "dark grey", "grey", "blue", " red", ""));

} // namespace penwick::test
