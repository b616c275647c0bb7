// SPDX-License-Identifier: MIT
// What is known to end a process where the component is built with less care.
#include "soak/RealBoard.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QApplication>
#include <QGuiApplication>

#include <gtest/gtest.h>

#include <sstream>

namespace penwick::test {
namespace {

constexpr Spot place { 200, 100 };
constexpr Spot elsewhere { 300, 150 };

class DangerousSession : public testing::Test
{
protected:
    DangerousSession() { m_board.open(); }

    /// The line of the board's state that begins with `what`.
    std::string line(const std::string &what)
    {
        std::istringstream lines(m_board.inWords());
        for (std::string each; std::getline(lines, each);) {
            if (each.starts_with(what))
                return each;
        }
        return {};
    }

    void leaveAnEmptyBoxOpen()
    {
        m_board.clickTool("text", true);
        m_board.press(place);
        m_board.release(place);
        m_board.turn();
        ASSERT_EQ(line("responder"), "responder b1");
    }

    void leaveABoxOpenWith(const std::string &letters)
    {
        leaveAnEmptyBoxOpen();
        for (const char letter : letters)
            m_board.key(std::string(1, letter));
    }

    RealBoard m_board;
};

DrawingCanvasView &canvasOf(const DrawingWindowController &board)
{
    return dynamic_cast<DrawingCanvasView &>(*contentOf(*board.drawingWindow()).contentView());
}

} // namespace

TEST_F(DangerousSession, endButtonWithAnEmptyTextBoxLeftOpenEndsTheSession)
{
    leaveAnEmptyBoxOpen();

    m_board.clickTool("state", true);

    EXPECT_EQ(line("posted"), "posted end");
    m_board.turn();
    m_board.open(); // what is left of the first goes
    EXPECT_EQ(line("views"), "views");
}

TEST_F(DangerousSession, titleBarWithAnEmptyTextBoxLeftOpenEndsTheSession)
{
    leaveAnEmptyBoxOpen();

    m_board.close();

    EXPECT_EQ(line("posted"), "posted end");
    m_board.turn();
    m_board.open();
    EXPECT_EQ(line("views"), "views");
}

TEST_F(DangerousSession, rightButtonDragOnANewBoardDrawsNothing)
{
    for (const Qt::MouseButton button : { Qt::RightButton, Qt::MiddleButton }) {
        m_board.press(place, button);
        m_board.move(elsewhere);
        m_board.release(elsewhere, button);
        m_board.turn();
    }

    EXPECT_EQ(line("strokes"), "strokes");
    EXPECT_EQ(line("posted"), "posted");
}

TEST_F(DangerousSession, leftDragThatBeginsWithTheRightButtonHeldIsAStroke)
{
    m_board.press(place, Qt::RightButton);
    m_board.press(place);
    m_board.move(elsewhere);
    m_board.release(elsewhere, Qt::RightButton);
    m_board.release(elsewhere);

    EXPECT_EQ(line("strokes"), "strokes s1:1");
}

TEST_F(DangerousSession, toolChosenThroughAccessibilityInTheMiddleOfAStrokeWaitsForItsEnd)
{
    m_board.press(place);
    m_board.move(elsewhere);

    for (const char *const tool : { "undo", "clear", "eraser", "text" })
        m_board.clickTool(tool, false);
    m_board.move(place);
    EXPECT_EQ(line("strokes"), "strokes s1:2");
    m_board.release(place);

    EXPECT_EQ(line("strokes"), "strokes");
    EXPECT_EQ(line("tool"), "tool text after text");
}

TEST_F(DangerousSession, endChosenThroughAccessibilityInTheMiddleOfAStrokeWaitsForItsEnd)
{
    m_board.press(place);

    m_board.clickTool("state", false);
    m_board.move(elsewhere);
    EXPECT_EQ(line("windows"), "windows drawing panel");
    m_board.release(elsewhere);

    EXPECT_EQ(line("windows"), "windows");
}

TEST_F(DangerousSession, boardHiddenInTheMiddleOfAStrokeForgetsThePress)
{
    m_board.press(place);
    m_board.hide();
    m_board.show();

    m_board.move(elsewhere);
    m_board.clickTool("undo", true);
    m_board.turn();

    EXPECT_EQ(line("redo"), "redo draw s1,");
}

TEST_F(DangerousSession, menuOfATextBoxGoesWhenItsBoardIsEndedHiddenMinimisedOrReplaced)
{
    for (const char *const how : { "end", "close", "hide", "minimise", "replace" }) {
        m_board.open();
        leaveABoxOpenWith("a");
        m_board.openMenuByKey();
        ASSERT_EQ(m_board.menu(), "b1") << how;

        if (how == std::string("end"))
            m_board.clickTool("state", false);
        else if (how == std::string("close"))
            m_board.close();
        else if (how == std::string("hide"))
            m_board.hide();
        else if (how == std::string("minimise"))
            m_board.minimise(true);
        else
            m_board.open();

        EXPECT_EQ(m_board.menu(), "") << how;
    }
}

TEST_F(DangerousSession, menuOfATextBoxGoesWhenItsEditingEndsOrItsBoxIsUndone)
{
    for (const char *const tool : { "text", "undo", "clear" }) {
        m_board.open();
        leaveABoxOpenWith("a");
        m_board.openMenuByKey();
        ASSERT_EQ(m_board.menu(), "b1") << tool;

        m_board.clickTool(tool, false); // as accessibility does, past the menu

        EXPECT_EQ(m_board.menu(), "") << tool;
    }
}

TEST_F(DangerousSession, textDraggedOverABoxThatGoesIsNotToldOfTheNextDrag)
{
    leaveAnEmptyBoxOpen();
    EXPECT_TRUE(m_board.dragOver(m_board.middleOf("b1"), "text"));

    m_board.open(); // the host replaces the board under the drag

    leaveAnEmptyBoxOpen();
    EXPECT_FALSE(m_board.dragOver(m_board.middleOf("b1"), "")); // a picture, which it refuses
    m_board.dragAway();
}

TEST_F(DangerousSession, pressIntoABoxKeepsWhatIsHalfComposedThere)
{
    leaveABoxOpenWith("a");
    m_board.compose("kan");

    m_board.press(m_board.middleOf("b1"));
    m_board.release(m_board.middleOf("b1"));

    EXPECT_EQ(m_board.textOf("b1"), "akan");
    EXPECT_EQ(m_board.composedIn("b1"), "");
    m_board.key("b");
    EXPECT_EQ(m_board.textOf("b1"), "akanb"); // the press was behind the text
}

TEST_F(DangerousSession, dragInABoxKeepsWhatIsHalfComposedThere)
{
    leaveAnEmptyBoxOpen();
    m_board.press(m_board.middleOf("b1"));
    m_board.compose("kan");

    m_board.move(elsewhere);
    m_board.release(elsewhere);

    EXPECT_EQ(m_board.textOf("b1"), "kan");
}

TEST_F(DangerousSession, undoInABoxThatIsEditedAgainKeepsWhatWasWrittenBefore)
{
    leaveABoxOpenWith("a");
    m_board.key("Return");
    m_board.press(m_board.middleOf("b1"));
    m_board.release(m_board.middleOf("b1"));
    m_board.pressAgain(m_board.middleOf("b1"));
    m_board.release(m_board.middleOf("b1"));
    m_board.key("End");
    m_board.key("b");
    ASSERT_EQ(m_board.textOf("b1"), "ab");

    for (int time = 0; time < 3; ++time)
        m_board.key("C-z");

    EXPECT_EQ(m_board.textOf("b1"), "a");
}

TEST_F(DangerousSession, windowRestoredAfterTheHostOpenedAnotherIsDrawnOn)
{
    Penwick host;
    const auto first = host.createDrawingWindowController(
        WindowType::whiteboard, QGuiApplication::primaryScreen());
    first->showWindow(nullptr);
    first->drawingWindow()->setWindowState(Qt::WindowMinimized);
    const auto second = host.createDrawingWindowController(
        WindowType::whiteboard, QGuiApplication::primaryScreen());
    second->showWindow(nullptr);

    first->drawingWindow()->setWindowState(Qt::WindowNoState);
    first->drawingWindow()->activateWindow();
    QCoreApplication::processEvents();
    ToolPanelViewController &bar = first->tPanelWindowController()->content();
    for (const char *const tool : { "color", "brush", "brush", "undo", "text", "clear" })
        bar.button(QLatin1String(tool))->click();
    canvasOf(*first).mouseDown({ { 50, 50 }, 1 });
    canvasOf(*first).mouseUp({ { 50, 50 }, 1 });

    EXPECT_EQ(canvasOf(*first).textBoxArray().size(), 1U);
    EXPECT_TRUE(canvasOf(*second).textBoxArray().isEmpty());
}

TEST_F(DangerousSession, imageWindowWithoutAnImageIsDrawnOnAndClosed)
{
    Penwick host;
    const auto board = host.createDrawingWindowController(
        WindowType::imageAnnotation, QGuiApplication::primaryScreen());
    board->showWindow(nullptr);
    QCoreApplication::processEvents();
    DrawingCanvasView &canvas = canvasOf(*board);

    canvas.mouseDown({ { 50, 50 }, 1 });
    canvas.mouseDragged({ { 60, 50 }, 1 });
    canvas.mouseUp({ { 60, 50 }, 1 });
    QKeyEvent undo(QEvent::KeyPress, Qt::Key_Z, Qt::ControlModifier);
    QCoreApplication::sendEvent(board->drawingWindow(), &undo);
    board->drawingWindow()->setFrameOrigin({ 10, 10 });
    QCoreApplication::processEvents();
    EXPECT_EQ(canvas.pathArray().size(), 1U);

    board->drawingWindow()->close();
    EXPECT_FALSE(board->drawingWindow()->isVisible());
}

} // namespace penwick::test
