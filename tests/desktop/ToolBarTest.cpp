// SPDX-License-Identifier: MIT
// The tool bar under a real pointer.
#include "desktop/support/ToolBarFixture.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

class ToolBar : public ToolBarTest
{ };

class ToolBarMinimised : public ToolBarTest
{
protected:
    enum class Draws
    {
        AStroke,
        Nothing
    };

    ToolBarMinimised()
    {
        open();
        m_board = window();
        m_bar = toolBarWindow();
        m_frame = toolBar().frame;
    }

    void drawAndMinimise(Draws what = Draws::AStroke)
    {
        if (what == Draws::AStroke) {
            drag({ { 200, 100 }, { 400, 100 } });
            waitForLevel({ 398, 100 }, inkOnWhite);
            EXPECT_TRUE(turnsEnabled("undo", true));
        }
        desktop().windows().minimise(m_board);
        EXPECT_TRUE(waitUntil([this] {
            const std::vector<WindowId> all = desktop().windows().ofProcess(host().processId());
            return std::none_of(all.begin(), all.end(),
                [this](WindowId each) { return desktop().windows().isShown(each); });
        }));
    }

    [[nodiscard]] WindowId board() const { return m_board; }
    [[nodiscard]] WindowId bar() const { return m_bar; }
    [[nodiscard]] QRect frame() const { return m_frame; } ///< of the bar, before

private:
    WindowId m_board = 0;
    WindowId m_bar = 0;
    QRect m_frame;
};

} // namespace

TEST_F(ToolBar, opensWithTheBrushSelectedTwentyPointsInside)
{
    open();

    EXPECT_TRUE(turns("brush", selected));
    for (const char *const tool : { "text", "eraser", "color", "undo", "redo", "clear" })
        EXPECT_EQ(background(tool), normal) << tool;
    EXPECT_EQ(background("state"), end);
    EXPECT_TRUE(comesToStandAt({ 20, 64 })); // centred: (480 - 352) / 2
}

TEST_F(ToolBar, knowsWhereItStands)
{
    open();

    // The window manager moves it once more after it was decorated, and tells it late.
    EXPECT_TRUE(waitUntil([this] {
        return host().window(QStringLiteral("toolPanel")).frame
            == desktop().windows().outerFrame(toolBarWindow());
    }));
}

TEST_F(ToolBar, eachPressedToolIsTheOneThatIsSelected)
{
    open();
    for (const char *const tool : { "text", "eraser", "brush", "eraser", "text" }) {
        press(tool);

        for (const char *const other : { "text", "brush", "eraser", "color", "clear" }) {
            const bool isOther = std::string(other) != tool;
            EXPECT_TRUE(turns(other, isOther ? normal : selected)) << other << " after " << tool;
        }
    }
}

TEST_F(ToolBar, pressedToolIsTheOneThatWorks)
{
    open();
    drag({ { 200, 100 }, { 400, 100 } });
    waitForLevel({ 398, 100 }, inkOnWhite);

    press("eraser");
    click({ 300, 100 });
    waitForLevel({ 300, 100 }, 255);

    press("brush");
    drag({ { 200, 200 }, { 400, 200 } });
    waitForLevel({ 398, 200 }, inkOnWhite);

    press("clear");
    waitForLevel({ 300, 200 }, 255);
    EXPECT_TRUE(turns("brush", selected));
    EXPECT_TRUE(turns("clear", normal));
}

TEST_F(ToolBar, doubleClickIsTwoPresses)
{
    open();

    desktop().pointer().click(centre("text"));
    desktop().pointer().click(centre("text"));

    static_cast<void>(popover());
    EXPECT_TRUE(turns("text", selected));
}

TEST_F(ToolBar, pointerOverAButtonIsShown)
{
    open();

    desktop().pointer().moveTo(centre("eraser"));
    EXPECT_TRUE(turns("eraser", selected));
    desktop().pointer().moveTo(centre("undo")); // which is disabled
    EXPECT_TRUE(turns("eraser", normal));
    EXPECT_EQ(background("undo"), normal);
    desktop().pointer().moveTo(centre("state"));
    EXPECT_TRUE(turns("state", QColor(255, 80, 134)));
    leave();
    EXPECT_TRUE(turns("state", end));
}

TEST_F(ToolBar, pointerIsAnArrowOverIt)
{
    open();
    desktop().pointer().moveTo(onScreen({ 300, 200 }));
    const QPoint brushHotSpot(0, 20);
    ASSERT_TRUE(waitUntil([&] { return desktop().pointer().look().hotSpot == brushHotSpot; }));
    const CursorLook brush = desktop().pointer().look();

    desktop().pointer().glideTo(centre("undo"));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() != brush; }));
    const CursorLook arrow = desktop().pointer().look();
    desktop().pointer().glideTo(centre("text"));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() == arrow; }));
    desktop().pointer().glideTo(onScreen({ 300, 200 }));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() == brush; }));
}

TEST_F(ToolBar, doesNotTakeTheKeysFromTheBoard)
{
    open();
    require([this] { return desktop().windows().active() == window(); }, "the board to be active");

    press("eraser");
    EXPECT_TRUE(turns("eraser", selected));
    press("color");
    choose("color#red");
    EXPECT_TRUE(isPopoverHidden());

    EXPECT_EQ(desktop().windows().active(), window());
}

TEST_F(ToolBar, undoIsOffAfterFiveStepsAndOnAgainAfterARedo)
{
    open();
    EXPECT_TRUE(turnsEnabled("undo", false));
    EXPECT_TRUE(turnsEnabled("redo", false));
    for (int y = 60; y <= 360; y += 50) // seven times
        drag({ { 200, y }, { 300, y } });
    waitForLevel({ 298, 360 }, inkOnWhite);
    EXPECT_TRUE(turnsEnabled("undo", true));

    for (int step = 1; step <= 5; ++step) {
        EXPECT_TRUE(turnsEnabled("undo", true)) << step;
        press("undo");
        waitForLevel({ 250, 410 - 50 * step }, 255);
    }

    EXPECT_TRUE(turnsEnabled("undo", false));
    EXPECT_TRUE(turnsEnabled("redo", true));
    EXPECT_NEAR(level({ 250, 110 }), inkOnWhite, 1); // the second, which is still there
    press("redo");
    waitForLevel({ 250, 160 }, inkOnWhite);
    EXPECT_TRUE(turnsEnabled("undo", true));
}

TEST_F(ToolBar, endClosesEverything)
{
    open();
    press("brush");
    static_cast<void>(popover());

    desktop().pointer().click(centre("state"));

    EXPECT_EQ(host().waitForExit(), 0);
    EXPECT_TRUE(waitUntil([this] { return desktop().windows().stackingOrder().empty(); }));
    for (const char *const name : { "drawing", "toolPanel", "popover" })
        EXPECT_FALSE(host().window(QLatin1String(name)).isVisible) << name;
    ASSERT_FALSE(host().notifications().empty());
    EXPECT_TRUE(host().notifications().back().name.endsWith(QLatin1String(".penwick.session.end")));
    EXPECT_EQ(host().notifications().back().object, QJsonValue(false));
    EXPECT_EQ(host().printedLines(), QStringList());
    EXPECT_EQ(host().errorOutput(), QString());
}

TEST_F(ToolBarMinimised, goesAndComesBackAsItWas)
{
    drawAndMinimise();
    desktop().windows().activate(board());

    EXPECT_TRUE(waitUntil([this] { return desktop().windows().isShown(bar()); }));
    EXPECT_EQ(toolBar().frame, frame());
    EXPECT_TRUE(turnsEnabled("undo", true));
    EXPECT_TRUE(turnsEnabled("redo", false));
    EXPECT_TRUE(turns("brush", selected));
    press("undo");
    waitForLevel({ 300, 100 }, 255);
}

TEST_F(ToolBarMinimised, goesAndComesBackWithItsPopover)
{
    press("color");
    const QRect popoverFrame = popover().frame;

    drawAndMinimise(Draws::Nothing);
    desktop().windows().activate(board());

    EXPECT_TRUE(waitUntil([this] { return desktop().windows().isShown(bar()); }));
    EXPECT_EQ(toolBar().frame, frame());
    EXPECT_EQ(popover().frame, popoverFrame);
}

} // namespace penwick::desktop
