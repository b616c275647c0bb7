// SPDX-License-Identifier: MIT
// What a person does with a window of each kind, one after the other, under each window manager.
// The table of the desktops in the README is made of these tests.
#include "desktop/support/FaultFixture.h"
#include "desktop/support/OtherProgram.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

constexpr QRect wholeScreen { 0, 0, 1280, 800 };

class Walk : public FaultTest, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    Walk()
        : FaultTest(std::get<WindowManager>(GetParam()))
    { }

    void startWalk()
    {
        desktop().startCompositor(); // or a layer would say that there is none
        startKind(std::get<const char *>(GetParam()));
        m_board = window();
        m_bar = toolBarWindow();
        expectPlacesKnown();
    }

    [[nodiscard]] QRect board() { return desktop().windows().outerFrame(m_board); }
    [[nodiscard]] QRect bar() { return desktop().windows().outerFrame(m_bar); }
    [[nodiscard]] WindowId boardWindow() const { return m_board; }
    [[nodiscard]] WindowId barWindow() const { return m_bar; }

    void press(const char *tool)
    {
        desktop().pointer().click(toolBar().buttons.value(QLatin1String(tool)));
    }

    /// A place on the content that nothing lies over.
    [[nodiscard]] QPoint place(QPoint fromCorner)
    {
        return desktop().windows().clientArea(m_board).topLeft() + fromCorner;
    }

    /// Whether the picture of `area` comes to be another than `before`.
    [[nodiscard]] bool changes(const QRect &area, const QImage &before)
    {
        return waitUntil([&] { return desktop().screen().picture(area) != before; });
    }

    /// The tool bar keeps its place beside the board, and can be seen and pressed.
    void expectBarBeside(QPoint offset)
    {
        EXPECT_TRUE(waitUntil([&] { return bar().topLeft() - board().topLeft() == offset; }))
            << testing::PrintToString(places());
        EXPECT_TRUE(waitUntil([&] { return desktop().windows().isShown(m_bar); }));
    }

private:
    WindowId m_board = 0;
    WindowId m_bar = 0;
};

/// Of those that have a title bar.
class FramedWalk : public Walk
{ };

} // namespace

TEST_P(Walk, drawnOnAndEnded)
{
    startWalk();

    expectInk();
    expectInk();

    expectNothingSaid();
    expectEndByTool();
}

TEST_P(Walk, popoverChoosesAColour)
{
    startWalk();
    press("color");
    const WindowState popover = host().waitForWindow(QStringLiteral("popover"));
    EXPECT_TRUE(wholeScreen.contains(popover.frame)) << testing::PrintToString(popover.frame);
    EXPECT_FALSE(popover.frame.intersects(bar()));

    desktop().pointer().click(popover.buttons.value(QStringLiteral("color#red")));

    EXPECT_TRUE(waitUntil([this] { return !host().window(QStringLiteral("popover")).isVisible; }));
    const QPoint from = place({ 200, 200 });
    desktop().pointer().drag({ from, from + QPoint(100, 0) });
    EXPECT_TRUE(waitUntil([&] {
        const QColor seen = desktop().screen().pixel(from + QPoint(50, 0));
        return seen.red() > 150 && seen.green() < 150 && seen.red() - seen.green() > 100;
    }));
    expectEndByTool();
}

TEST_P(Walk, textIsWritten)
{
    startWalk();
    press("text");
    const QRect line(place({ 205, 195 }), QSize(120, 24));
    desktop().pointer().click(place({ 200, 200 }));
    const QImage empty = desktop().screen().picture(line);

    desktop().keyboard().type("mmmm");

    EXPECT_TRUE(changes(line, empty));
    desktop().keyboard().press("Return");
    EXPECT_TRUE(host().window(QStringLiteral("drawing")).isVisible) << "the keys went to the text";
    expectEndByTool();
}

TEST_P(Walk, barIsDraggedAndBroughtBackInside)
{
    startWalk();
    const QPoint handle = bar().topLeft() + QPoint(26, 8);
    const QRect before = bar();

    desktop().pointer().takeHold(handle);
    desktop().pointer().glideTo(handle + QPoint(60, 20));
    desktop().pointer().letGo();
    EXPECT_TRUE(waitUntil([&] { return bar() == before.translated(60, 20); }))
        << testing::PrintToString(bar());

    desktop().pointer().takeHold(handle + QPoint(60, 20));
    desktop().pointer().glideTo({ 5, 795 });
    desktop().pointer().letGo();
    EXPECT_TRUE(waitUntil([&] { return board().contains(bar()); }))
        << testing::PrintToString(bar());
    expectPlacesKnown();
    expectEndByTool();
}

TEST_P(FramedWalk, minimisedAndRestored)
{
    startWalk();
    expectInk();
    const QRect before = board();
    const QPoint offset = bar().topLeft() - before.topLeft();

    desktop().windows().minimise(boardWindow());
    EXPECT_TRUE(waitUntil([&] {
        return !desktop().windows().isShown(boardWindow())
            && !desktop().windows().isShown(barWindow());
    }));

    desktop().windows().activate(boardWindow());
    EXPECT_TRUE(waitUntil([&] {
        return desktop().windows().isShown(boardWindow()) && board() == before;
    })) << testing::PrintToString(board());
    expectBarBeside(offset);
    expectInk();
    expectEndByTool();
}

TEST_P(Walk, anotherProgramIsActivatedAndTheBarStays)
{
    OtherProgram other(desktop(), { 900, 700, 200, 60 }, { 20, 150, 160 });
    startWalk();
    const QPoint offset = bar().topLeft() - board().topLeft();
    desktop().windows().activate(other.window());
    require([&] { return desktop().windows().active() == other.window(); },
        "the other program to be active");

    expectBarBeside(offset);
    expectEndByTool();
}

TEST_P(FramedWalk, movedWithItsBar)
{
    startWalk();
    expectInk();
    const QRect before = board();
    const QPoint offset = bar().topLeft() - before.topLeft();

    pull({ before.center().x(), before.top() + 10 }, { 90, -60 });

    EXPECT_TRUE(waitUntil([&] { return board() == before.translated(90, -60); }))
        << testing::PrintToString(board());
    expectBarBeside(offset);
    expectPlacesKnown();
    expectInk();
    expectEndByTool();
}

TEST_P(FramedWalk, resizedAtEveryEdge)
{
    constexpr int rounding = 2; // pixels, by the window manager
    startWalk();
    for (const QPoint side :
        { QPoint(1, 0), QPoint(-1, 0), QPoint(0, 1), QPoint(0, -1), QPoint(1, 1), QPoint(-1, 1) }) {
        SCOPED_TRACE(testing::PrintToString(side));
        const QRect before = board();

        pull(gripOf(before, side), side * 20);

        EXPECT_TRUE(waitUntil([&] {
            const QSize size = board().size();
            return size != before.size()
                && std::abs(size.width() * 9.0 / 16 - size.height()) <= rounding;
        })) << testing::PrintToString(board());
        expectPlacesKnown();
        EXPECT_TRUE(board().contains(bar())) << testing::PrintToString(places());
    }
    expectInk();
    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, Walk,
    testing::Combine(testing::ValuesIn(eachManager()), testing::ValuesIn(allKinds())),
    managerAndKindName);

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, FramedWalk,
    testing::Combine(
        testing::ValuesIn(eachManager()), testing::Values("whiteboard", "imageAnnotation")),
    managerAndKindName);

} // namespace penwick::desktop
