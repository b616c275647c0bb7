// SPDX-License-Identifier: MIT
// What each attribute of a window means in Qt's words.
#include "platform/window/WindowFlags.h"

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

constexpr Qt::WindowFlags titleBar = Qt::WindowTitleHint | Qt::WindowSystemMenuHint;
constexpr Qt::WindowFlags ordinary = Qt::Window | Qt::CustomizeWindowHint | titleBar
    | Qt::WindowCloseButtonHint | Qt::WindowMinimizeButtonHint;

} // namespace

TEST(WindowFlags, ordinaryWindowHasATitleBarToCloseAndToMinimise)
{
    EXPECT_EQ(windowFlagsFor({}), ordinary);
    EXPECT_TRUE(canBecomeKey({}));
}

TEST(WindowFlags, resizableWindowMayBeMaximised)
{
    WindowAttributes attributes;
    attributes.styleMask |= StyleMask::resizable;

    EXPECT_EQ(windowFlagsFor(attributes), ordinary | Qt::WindowMaximizeButtonHint);
}

TEST(WindowFlags, windowWithoutATitleIsAToolThatTakesNoKeys)
{
    WindowAttributes attributes;
    attributes.styleMask = {};

    EXPECT_FALSE(canBecomeKey(attributes));
    EXPECT_EQ(windowFlagsFor(attributes),
        Qt::Tool | Qt::CustomizeWindowHint | Qt::FramelessWindowHint
            | Qt::WindowDoesNotAcceptFocus);
}

TEST(WindowFlags, hiddenTitleOverTheContentLeavesNoTitleBarButTheKeys)
{
    WindowAttributes attributes;
    attributes.styleMask = StyleMask::titled | StyleMask::fullSizeContentView;
    attributes.titlebarAppearsTransparent = true;
    attributes.titleVisibility = TitleVisibility::hidden;

    EXPECT_TRUE(canBecomeKey(attributes));
    EXPECT_EQ(
        windowFlagsFor(attributes), Qt::Window | Qt::CustomizeWindowHint | Qt::FramelessWindowHint);
}

TEST(WindowFlags, titleBarStaysWhileAnyOfItsPartsIsSeen)
{
    WindowAttributes shown;
    shown.styleMask = StyleMask::titled | StyleMask::fullSizeContentView;
    shown.titlebarAppearsTransparent = true;
    WindowAttributes opaque = shown;
    opaque.titlebarAppearsTransparent = false;
    opaque.titleVisibility = TitleVisibility::hidden;
    WindowAttributes beside = shown;
    beside.styleMask = StyleMask::titled;
    beside.titleVisibility = TitleVisibility::hidden;

    for (const WindowAttributes &attributes : { shown, opaque, beside })
        EXPECT_EQ(windowFlagsFor(attributes), Qt::Window | Qt::CustomizeWindowHint | titleBar);
}

TEST(WindowFlags, onlyALevelAboveTheOrdinaryOneStaysOnTop)
{
    WindowAttributes attributes;
    attributes.level = WindowLevel::mainMenu;
    EXPECT_EQ(windowFlagsFor(attributes), ordinary | Qt::WindowStaysOnTopHint);

    attributes.level = static_cast<WindowLevel>(-1);
    EXPECT_EQ(windowFlagsFor(attributes), ordinary);
}

TEST(WindowFlags, shadowAndMouseAreTakenAwayByOneFlagEach)
{
    WindowAttributes attributes;
    attributes.hasShadow = false;
    EXPECT_EQ(windowFlagsFor(attributes), ordinary | Qt::NoDropShadowWindowHint);

    attributes.hasShadow = true;
    attributes.ignoresMouseEvents = true;
    EXPECT_EQ(windowFlagsFor(attributes), ordinary | Qt::WindowTransparentForInput);
}

} // namespace penwick::platform
