// SPDX-License-Identifier: MIT
// The component's windows among those of other programs: who lies above whom, who stays on the
// screen, and on which virtual desktops.
#include "desktop/support/FaultFixture.h"
#include "desktop/support/OtherProgram.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

constexpr QRect screen { 0, 0, 1280, 800 };
constexpr QRect beside { 1080, 20, 180, 120 }; // where none of the component's windows is
constexpr QColor orange { 230, 120, 20 };
constexpr unsigned long everyDesktop = 0xFFFFFFFF;
constexpr std::chrono::milliseconds longerThanAnyAnswer { 500 };

class AmongPrograms : public FaultTest
{
protected:
    using FaultTest::FaultTest;

    void activate(const OtherProgram &other)
    {
        desktop().windows().activate(other.window());
        require([&] { return desktop().windows().active() == other.window(); },
            "the other program to be active");
    }

    [[nodiscard]] bool isAbove(WindowId upper, WindowId lower)
    {
        const std::vector<WindowId> order = desktop().windows().stackingOrder();
        const auto above = std::find(order.begin(), order.end(), upper);
        return above != order.end() && std::find(order.begin(), above, lower) != above;
    }

    [[nodiscard]] std::vector<unsigned long> desktopsOf(WindowId window)
    {
        return desktop().windows().numbers(window, "_NET_WM_DESKTOP");
    }
};

class LayerAmongPrograms : public AmongPrograms, public testing::WithParamInterface<WindowManager>
{
protected:
    LayerAmongPrograms()
        : AmongPrograms(GetParam())
        , other(desktop(), screen, orange, OtherProgram::Kind::FullScreen)
    {
        startKind("annotation");
        layer = window();
        bar = toolBarWindow();
        activate(other);
    }

    OtherProgram other;
    WindowId layer = 0;
    WindowId bar = 0;
};

class WindowAmongPrograms : public AmongPrograms, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    WindowAmongPrograms()
        : AmongPrograms(std::get<WindowManager>(GetParam()))
    {
        startKind(std::get<const char *>(GetParam()));
    }
};

} // namespace

TEST_P(LayerAmongPrograms, staysAboveAFullScreenUnlessTheWindowManagerHasThatAboveAll)
{
    const bool isCovered = traitsOf(GetParam()).hasFullScreenAboveAll;
    EXPECT_TRUE(waitUntil([&] { return isAbove(layer, other.window()) != isCovered; }));
    EXPECT_FALSE(waitUntil(
        [&] { return isAbove(layer, other.window()) == isCovered; }, longerThanAnyAnswer));
    EXPECT_TRUE(isAbove(bar, other.window()));
    EXPECT_EQ(desktop().windows().outerFrame(layer), screen);
}

TEST_P(LayerAmongPrograms, isEndedWhileAFullScreenProgramIsActive)
{
    expectEndByTool();
}

TEST_P(LayerAmongPrograms, comesForthWithTheKeysWhenAToolIsChosenOverAFullScreenProgram)
{
    desktop().pointer().click(toolBar().buttons.value(QStringLiteral("brush")));

    EXPECT_TRUE(waitUntil(
        [&] { return desktop().windows().active() == layer && isAbove(layer, other.window()); }));
    EXPECT_TRUE(isAbove(bar, layer));
    expectInk();
}

INSTANTIATE_TEST_SUITE_P(
    WindowManagers, LayerAmongPrograms, testing::ValuesIn(eachManager()), managerName);

TEST_P(WindowAmongPrograms, keepsItsToolBarWhileAnotherProgramIsActive)
{
    const WindowId bar = toolBarWindow();
    const OtherProgram other(desktop(), beside, orange);

    activate(other);

    EXPECT_FALSE(waitUntil([&] { return !desktop().windows().isShown(bar); }, longerThanAnyAnswer));
    EXPECT_TRUE(isAbove(bar, window()));
    expectInk();
    expectEndByTool();
}

TEST_P(WindowAmongPrograms, staysOnItsVirtualDesktopWhileItsToolBarIsOnAll)
{
    const WindowId board = window();
    const WindowId bar = toolBarWindow();
    EXPECT_TRUE(waitUntil([&] { return desktopsOf(bar) == std::vector { everyDesktop }; }));
    EXPECT_FALSE(
        waitUntil([&] { return desktopsOf(board) != std::vector { 0UL }; }, longerThanAnyAnswer));

    desktop().windows().switchToDesktop(1);

    EXPECT_TRUE(waitUntil([&] { return desktop().windows().isShown(bar); }));
    EXPECT_FALSE(waitUntil([&] { return !desktop().windows().isShown(bar); }, longerThanAnyAnswer));
    EXPECT_EQ(desktopsOf(bar), std::vector { everyDesktop });
    EXPECT_EQ(desktopsOf(board), std::vector { 0UL });
    EXPECT_FALSE(desktop().windows().isShown(board));

    desktop().windows().switchToDesktop(0);
    EXPECT_TRUE(waitUntil([&] { return desktop().windows().isShown(board); }));
    EXPECT_TRUE(desktop().windows().isShown(bar));
    expectInk();
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, WindowAmongPrograms,
    testing::Combine(
        testing::ValuesIn(eachManager()), testing::Values("whiteboard", "imageAnnotation")),
    managerAndKindName);

} // namespace penwick::desktop
