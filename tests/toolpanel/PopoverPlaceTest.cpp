// SPDX-License-Identifier: MIT
// Where a popover is shown: beside its button, on the screen, and never over the bar.
#include "toolpanel/ToolPanelFixture.h"

#include <string>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;

struct Corner
{
    const char *name;
    Point bar; // its frame's origin on the screen of 800 x 800
};

/// The bar somewhere, and the button whose second press shows a popover.
using Place = std::tuple<Corner, const char *>;

class PopoverPlace : public ToolPanelFixture, public testing::WithParamInterface<Place>
{
protected:
    static constexpr Rect screen { 0, 0, 800, 800 };
    static constexpr double barWidth = 52;
    static constexpr double barHeight = 352;

    void openAt(Point place, const char *tool)
    {
        panel.setFrameOrigin(place);
        QCoreApplication::processEvents();
        press(tool);
        if (!isPopoverShown())
            press(tool);
        ASSERT_TRUE(isPopoverShown());
    }

    static bool isInside(const Rect &inner, const Rect &outer)
    {
        return inner.x >= outer.x && inner.y >= outer.y && inner.maxX() <= outer.maxX()
            && inner.maxY() <= outer.maxY();
    }
};

std::string placeName(const testing::TestParamInfo<Place> &place)
{
    return std::string(std::get<1>(place.param)) + std::get<0>(place.param).name;
}

} // namespace

TEST_P(PopoverPlace, isOnTheScreenBesideTheBar)
{
    openAt(std::get<0>(GetParam()).bar, std::get<1>(GetParam()));

    EXPECT_TRUE(isInside(popover().frame(), screen));
    EXPECT_FALSE(popover().frame().intersects(panel.frame()));
    EXPECT_EQ(popover().frame().size(), (platform::Size { 136, 136 }));
}

TEST_P(PopoverPlace, isClosedByTheNextPress)
{
    const char *const tool = std::get<1>(GetParam());
    openAt(std::get<0>(GetParam()).bar, tool);

    press(tool);
    EXPECT_FALSE(isPopoverShown());
    press(tool);
    EXPECT_TRUE(isPopoverShown());
    EXPECT_TRUE(isInside(popover().frame(), screen));
}

INSTANTIATE_TEST_SUITE_P(Corners, PopoverPlace,
    testing::Combine(
        testing::Values(Corner { "LowerLeft", { 0, 0 } }, Corner { "LowerRight", { 748, 0 } },
            Corner { "UpperLeft", { 0, 448 } }, Corner { "UpperRight", { 748, 448 } },
            Corner { "Middle", { 374, 224 } }, Corner { "HalfOutRight", { 780, 224 } },
            Corner { "HalfOutLeft", { -30, 224 } }, Corner { "HalfOutBelow", { 374, -180 } },
            Corner { "NearTheRight", { 600, 224 } }),
        testing::Values("text", "brush", "color")),
    placeName);

using PopoverPlaces = PopoverPlace;

TEST_F(PopoverPlaces, isTheButtonsOwnWhereThereIsRoom)
{
    openAt({ 374, 224 }, "color");

    EXPECT_EQ(popover().frame().origin(),
        (Point { 374 + barWidth + 10 + 8, 224 + button("color").frame().y }));
}

TEST_F(PopoverPlaces, isAsFarOnTheOtherSideOfABarAtTheRight)
{
    openAt({ 748, 224 }, "color");

    EXPECT_EQ(
        popover().frame().origin(), (Point { 748 - 18 - 136, 224 + button("color").frame().y }));
}

TEST_F(PopoverPlaces, isLowerForABarAtTheTop)
{
    openAt({ 374, 448 }, "brush");

    EXPECT_EQ(popover().frame().origin(), (Point { 374 + barWidth + 18, 800 - 136 }));
}

} // namespace penwick::test
