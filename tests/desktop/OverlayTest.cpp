// SPDX-License-Identifier: MIT
// The layer over a screen: where it lies, what shines through it, and who gets the pointer there.
#include "desktop/support/BoardFixture.h"
#include "desktop/support/OtherProgram.h"

#include <algorithm>
#include <cmath>

namespace penwick::desktop {

namespace {

constexpr QRect wholeScreen { 0, 0, 1280, 800 };
constexpr QRect otherArea { 300, 200, 500, 300 };
constexpr QColor orange { 230, 120, 20 };
constexpr QColor teal { 20, 150, 160 };

// What the brush leaves on `ground`: its ink at alpha 0.7.
QColor inkOn(const QColor &ground)
{
    constexpr double ink = 41;
    const auto mixed
        = [](int level) { return static_cast<int>(std::lround(0.7 * ink + 0.3 * level)); };
    return { mixed(ground.red()), mixed(ground.green()), mixed(ground.blue()) };
}

class Overlay : public BoardUnderEachManager
{
protected:
    static constexpr unsigned long everyDesktop = 0xFFFFFFFF;

    void startOverlay(HostProgram program = HostProgram::AsShipped)
    {
        start({ "--window", "annotation" }, program);
        static_cast<void>(toolBar());
    }

    /// What the window manager manages above `window`, the undermost first.
    [[nodiscard]] std::vector<WindowId> above(WindowId window)
    {
        std::vector<WindowId> order = desktop().windows().stackingOrder();
        order.erase(order.begin(), std::find(order.begin(), order.end(), window) + 1);
        return order;
    }

    [[nodiscard]] bool comesToShow(QPoint place, const QColor &color)
    {
        return waitUntil([&] { return isNearly(desktop().screen().pixel(place), color); });
    }

    // A compositing manager rounds, too.
    [[nodiscard]] static bool isNearly(const QColor &one, const QColor &other)
    {
        return std::abs(one.red() - other.red()) <= 2 && std::abs(one.green() - other.green()) <= 2
            && std::abs(one.blue() - other.blue()) <= 2;
    }

    /// Where within `area` the screen is not of `color`; null if it is everywhere.
    [[nodiscard]] QRect otherThan(const QColor &color, const QRect &area)
    {
        const QImage seen = desktop().screen().picture(area);
        QImage plain(seen.size(), seen.format());
        plain.fill(color);
        const QRect found = difference(seen, plain);
        return found.isNull() ? QRect() : found.translated(area.topLeft());
    }

    /// Draws a stroke over the other program's window, and looks at every pixel there.
    void expectStrokeOver(const QColor &ground)
    {
        const QPoint from(450, 350);
        const QPoint to(650, 350);

        desktop().pointer().drag({ from, to });

        ASSERT_TRUE(comesToShow(to, inkOn(ground)));
        EXPECT_TRUE(isNearly(desktop().screen().pixel(from), inkOn(ground)));
        EXPECT_TRUE(isNearly(desktop().screen().pixel((from + to) / 2), inkOn(ground)));
        // Nothing else: the stroke's line of five pixels, its round ends and softened edges.
        // The end's last step may be shown a moment after the first that covers its middle.
        const QRect stroke(447, 347, 206, 6);
        EXPECT_TRUE(waitUntil([&] { return otherThan(ground, otherArea) == stroke; }))
            << testing::PrintToString(otherThan(ground, otherArea));
    }
};

} // namespace

TEST_P(Overlay, coversExactlyTheScreen)
{
    startOverlay();

    EXPECT_EQ(host().window(QStringLiteral("drawing")).frame, wholeScreen);
    EXPECT_EQ(desktop().windows().clientArea(window()), wholeScreen);
    EXPECT_EQ(desktop().windows().outerFrame(window()), wholeScreen);
}

TEST_P(Overlay, andItsToolBarHaveOneSizeEach)
{
    startOverlay();
    // Of the size hints the first number is which of the others count.
    constexpr unsigned long leastAndMost = 16 + 32;
    for (const WindowId each : { window(), toolBarWindow() }) {
        const auto hints = desktop().windows().numbers(each, "WM_NORMAL_HINTS");
        ASSERT_EQ(hints.size(), 18U);
        EXPECT_EQ(hints[0] & leastAndMost, leastAndMost);
        const QSize size = desktop().windows().clientArea(each).size();
        EXPECT_EQ(QSize(static_cast<int>(hints[5]), static_cast<int>(hints[6])), size);
        EXPECT_EQ(QSize(static_cast<int>(hints[7]), static_cast<int>(hints[8])), size);
    }
}

TEST_P(Overlay, liesAboveOtherWindowsAndDocksAlsoAfterTheyAreActivated)
{
    OtherProgram dock(desktop(), { 0, 770, 1280, 30 }, teal, OtherProgram::Kind::Dock);
    OtherProgram other(desktop(), otherArea, orange);
    startOverlay();
    const std::vector<WindowId> justTheToolBar { toolBarWindow() };
    EXPECT_EQ(above(window()), justTheToolBar);

    desktop().windows().activate(other.window());
    other.raise();

    require([&] { return desktop().windows().active() == other.window(); },
        "the other window to be active");
    EXPECT_EQ(above(window()), justTheToolBar);
}

TEST_P(Overlay, isOnEveryVirtualDesktopWithItsToolBar)
{
    startOverlay();
    const WindowId overlay = window();
    const WindowId bar = toolBarWindow();
    const std::vector<unsigned long> every { everyDesktop };
    Windows &windows = desktop().windows();
    EXPECT_TRUE(waitUntil([&] { return windows.numbers(overlay, "_NET_WM_DESKTOP") == every; }));
    EXPECT_TRUE(waitUntil([&] { return windows.numbers(bar, "_NET_WM_DESKTOP") == every; }));

    windows.switchToDesktop(1);

    EXPECT_TRUE(windows.isShown(overlay));
    EXPECT_TRUE(windows.isShown(bar));
    EXPECT_EQ(windows.outerFrame(overlay), wholeScreen);
}

TEST_P(Overlay, withACompositingManagerWhatIsBelowShinesThroughAndAStrokeLiesOverIt)
{
    desktop().startCompositor();
    OtherProgram other(desktop(), otherArea, orange);
    startOverlay();
    ASSERT_TRUE(waitUntil([this] { return otherThan(orange, otherArea).isNull(); }));

    expectStrokeOver(orange);

    EXPECT_EQ(host().errorOutput(), QString());
}

TEST_P(Overlay, withACompositingManagerAChangeBelowIsSeenAtOnce)
{
    desktop().startCompositor();
    OtherProgram other(desktop(), otherArea, orange);
    startOverlay();

    other.turn(teal);

    EXPECT_TRUE(waitUntil([&] { return otherThan(teal, otherArea) == QRect(); }));
    expectStrokeOver(teal);
}

TEST_P(Overlay, withoutACompositingManagerItShowsAPictureOfWhatWasBelowAndSaysSoOnce)
{
    OtherProgram other(desktop(), otherArea, orange);
    const QRect desk(900, 100, 300, 300); // beside the other window
    const QImage deskBefore = desktop().screen().picture(desk);
    startOverlay();
    ASSERT_TRUE(waitUntil([&] { return otherThan(orange, otherArea) == QRect(); }));

    expectStrokeOver(orange);

    EXPECT_EQ(desktop().screen().picture(desk), deskBefore);
    EXPECT_EQ(host().errorOutput(),
        QStringLiteral("penwick.desktop: no compositing manager: a transparent layer shows a "
                       "picture of what was below it when it opened\n"));
}

TEST_P(Overlay, takesThePointerWhereItIsTransparentWithACompositingManager)
{
    desktop().startCompositor();
    OtherProgram other(desktop(), otherArea, orange);
    desktop().pointer().click({ 500, 400 });
    ASSERT_TRUE(waitUntil([&] { return other.presses() == 1; }));
    startOverlay();

    expectStrokeOver(orange);

    EXPECT_EQ(other.presses(), 1);
}

TEST_P(Overlay, takesThePointerWhereItIsTransparentWithoutACompositingManager)
{
    OtherProgram other(desktop(), otherArea, orange);
    startOverlay();

    expectStrokeOver(orange);

    EXPECT_EQ(other.presses(), 0);
}

INSTANTIATE_TEST_SUITE_P(WindowManagers, Overlay, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
