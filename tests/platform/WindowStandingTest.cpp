// SPDX-License-Identifier: MIT
// What a window's attributes, and those of the window below it, mean for its standing among the
// windows of other programs.
#include "platform/window/WindowFlags.h"

#include <gtest/gtest.h>

#include <optional>
#include <ostream>

namespace penwick::platform {

namespace {

// As the kinds of windows of the component are.
WindowAttributes board()
{
    return {};
}

WindowAttributes layer()
{
    WindowAttributes attributes;
    attributes.styleMask |= StyleMask::fullSizeContentView;
    attributes.titlebarAppearsTransparent = true;
    attributes.titleVisibility = TitleVisibility::hidden;
    attributes.collectionBehavior = everywhere;
    attributes.level = WindowLevel::mainMenu;
    return attributes;
}

WindowAttributes boardAboveAll()
{
    WindowAttributes attributes;
    attributes.level = WindowLevel::mainMenu;
    return attributes;
}

WindowAttributes bar()
{
    WindowAttributes attributes = layer();
    attributes.styleMask = StyleMask::fullSizeContentView;
    return attributes;
}

WindowAttributes popover()
{
    WindowAttributes attributes = bar();
    attributes.collectionBehavior = {};
    return attributes;
}

struct Case
{
    const char *name;
    WindowAttributes attributes;
    std::optional<WindowAttributes> below;
    WindowStanding standing;
};

void PrintTo(const Case &row, std::ostream *stream)
{
    *stream << row.name;
}

std::string caseName(const testing::TestParamInfo<Case> &info)
{
    return info.param.name;
}

class Standing : public testing::TestWithParam<Case>
{ };

} // namespace

TEST_P(Standing, followsFromTheAttributesAndFromWhatIsBelow)
{
    const Case &row = GetParam();

    EXPECT_EQ(standingOf(row.attributes, row.below ? &*row.below : nullptr), row.standing);
}

INSTANTIATE_TEST_SUITE_P(Table, Standing,
    testing::Values( //
        Case { "Board", board(), std::nullopt, {} },
        Case { "Layer", layer(), std::nullopt, { .isOnAllDesktops = true, .isLayer = true } },
        Case { "LayerAboveABoard", layer(), board(), { .isOnAllDesktops = true, .isLayer = true } },
        Case { "Bar", bar(), std::nullopt, { .isOnAllDesktops = true, .isPanel = true } },
        Case { "BarOfABoard", bar(), board(), { .isOnAllDesktops = true, .isPanel = true } },
        Case { "BarOfALayer", bar(), layer(),
            { .isOnAllDesktops = true, .isPanel = true, .isUnmanaged = true } },
        Case { "PopoverOfABoard", popover(), board(), { .isPanel = true } },
        Case { "PopoverOfALayer", popover(), layer(), { .isPanel = true, .isUnmanaged = true } },
        Case { "BoardOfAHostAboveAll", boardAboveAll(), std::nullopt, {} },
        Case { "BarOfABoardAboveAll", bar(), boardAboveAll(),
            { .isOnAllDesktops = true, .isPanel = true } },
        Case { "BoardAboveALayer", board(), layer(), {} }),
    caseName);

} // namespace penwick::platform
