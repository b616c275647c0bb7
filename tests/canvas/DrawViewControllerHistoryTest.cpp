// SPDX-License-Identifier: MIT
// Undo, redo and clear, as they reach a canvas.
#include "canvas/CanvasFixture.h"

#include "history/NotificationNames.h"
#include "platform/view/ImageView.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/NotificationCenter.h>

namespace penwick::test {
namespace {

constexpr QRect wholeCanvas { 0, 0, 300, 200 };

const QString brush = QStringLiteral("brush");
const QString eraser = QStringLiteral("eraser");
const QString text = QStringLiteral("text");
const QString clear = QStringLiteral("clear");
const QString undo = QStringLiteral("undo");
const QString redo = QStringLiteral("redo");

using DrawViewControllerHistoryTest = CanvasFixture;

// Undo and redo

TEST_F(DrawViewControllerHistoryTest, undoAndRedoOfAStrokeReachTheScreenAndGoBackToTheLastTool)
{
    const std::int64_t id = stroke({ { 20, 50.5 }, { 200, 50.5 } });
    const QImage drawn = onScreen();
    controller->handleToolSelection(eraser);
    static_cast<void>(recorder.take());

    controller->handleToolSelection(undo);
    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids());
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "enableUndo false", "redraw" }));
    settle();
    EXPECT_EQ(greyAt(onScreen(), { 100, 50 }), 255);

    controller->handleToolSelection(redo);
    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids { id });
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    settle();
    EXPECT_EQ(onScreen(), drawn);
}

TEST_F(DrawViewControllerHistoryTest, undoAndRedoOfNothingPostAndPaintNothing)
{
    PaintRecorder painted(*canvas);

    controller->handleToolSelection(undo);
    controller->handleToolSelection(redo);

    EXPECT_EQ(canvas->currentSelectedTool(), brush);
    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect>());
}

TEST_F(DrawViewControllerHistoryTest, undoOfATextBoxTakesItOffTheCanvasAndRedoBringsTheSameBack)
{
    const std::int64_t id = textBox({ 20, 100 });
    const auto box = model().textBoxArray().last().textBox;
    platform::View *const button = box->deleteTextButton();
    static_cast<void>(recorder.take());

    controller->handleToolSelection(undo);
    EXPECT_EQ(canvas->subviews(), std::vector<platform::View *> { button });
    EXPECT_TRUE(button->isHidden());
    EXPECT_EQ(idsOf(canvas->textBoxArray()), Ids());
    EXPECT_EQ(recorder.take(),
        (Posts { "removeWithId " + std::to_string(id), "redraw", "enableRedo true",
            "enableUndo false", "redraw" }));

    controller->handleToolSelection(redo);
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(canvas->subviews(), std::vector<platform::View *> { button });
    settle(); // it comes with the repaint
    EXPECT_EQ(canvas->subviews(), (std::vector<platform::View *> { button, box.get() }));
    EXPECT_TRUE(button->isHidden());
    EXPECT_EQ(box->frame(), (Rect { 20, 76, 200, 30 }));
}

TEST_F(DrawViewControllerHistoryTest, erasedStrokeComesBackAboveLaterOnes)
{
    const std::int64_t first = stroke({ { 20, 50 }, { 200, 50 } });
    const std::int64_t second = stroke({ { 20, 100 }, { 200, 100 } });
    controller->handleToolSelection(eraser);
    click({ 100, 50 });
    ASSERT_EQ(idsOf(canvas->pathArray()), Ids { second });

    controller->handleToolSelection(undo);

    EXPECT_EQ(idsOf(canvas->pathArray()), (Ids { second, first }));
}

// Clear

TEST_F(DrawViewControllerHistoryTest, clearOfAnEmptyCanvasTouchesNeitherModelNorHistory)
{
    controller->handleToolSelection(eraser);
    PaintRecorder painted(*canvas);

    controller->handleToolSelection(clear);

    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
    EXPECT_TRUE(history().undoStack().isEmpty());
    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect>());
}

TEST_F(DrawViewControllerHistoryTest, clearDropsStrokesAndBoxesAndOneUndoBringsAllBack)
{
    const Ids strokes { stroke({ { 20, 50 }, { 200, 50 } }),
        stroke({ { 20, 150 }, { 200, 150 } }) };
    const std::int64_t box = placedTextBox({ 20, 100 });
    static_cast<void>(recorder.take());
    PaintRecorder painted(*canvas);

    controller->handleToolSelection(clear);

    EXPECT_EQ(canvas->currentSelectedTool(), brush);
    EXPECT_TRUE(canvas->subviews().empty());
    EXPECT_TRUE(canvas->pathArray().isEmpty());
    EXPECT_TRUE(canvas->textBoxArray().isEmpty());
    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(history().undoStack().size(), 3);
    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableRedo false", "enableUndo true" }));
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect> { wholeCanvas });

    controller->handleToolSelection(undo);
    settle();
    EXPECT_EQ(idsOf(canvas->pathArray()), (Ids { strokes[1], strokes[0] }));
    EXPECT_EQ(idsOf(canvas->textBoxArray()), Ids { box });
    EXPECT_EQ(canvas->subviews().size(), 1U);
    EXPECT_EQ(recorder.take(),
        (Posts { "enableRedo true", "enableRedo true", "enableRedo true", "enableUndo false",
            "redraw" }));
}

TEST_F(DrawViewControllerHistoryTest, clearWithStrokesOnlyOrBoxesOnlyClears)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    controller->handleToolSelection(clear);
    EXPECT_EQ(history().undoStack().size(), 1);
    EXPECT_TRUE(model().pathArray().isEmpty());

    placedTextBox({ 20, 100 });
    controller->handleToolSelection(clear);
    EXPECT_EQ(history().undoStack().size(), 1);
    EXPECT_TRUE(model().textBoxArray().isEmpty());
}

// Nothing was drawn, yet there is something to clear: any subview counts, a hidden one too.
TEST_F(DrawViewControllerHistoryTest, clearWithNothingButAHiddenSubviewClears)
{
    const auto view = addPlainView();
    view->setHidden(true);

    controller->handleToolSelection(clear);

    EXPECT_TRUE(canvas->subviews().empty());
    EXPECT_EQ(view->superview(), nullptr);
    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableRedo false", "enableUndo true" }));
}

TEST_F(DrawViewControllerHistoryTest, clearWhileABoxIsEditedLeavesNobodyFirstResponder)
{
    writtenTextBox({ 20, 100 });
    ASSERT_EQ(contentOf(window).firstResponder(), canvas->subviews().front());

    controller->handleToolSelection(clear);

    EXPECT_EQ(contentOf(window).firstResponder(), nullptr);
    EXPECT_TRUE(canvas->subviews().empty());
    EXPECT_EQ(history().undoStack().size(), 1);
}

TEST_F(DrawViewControllerHistoryTest, clearedBoxesAreOffTheCanvasBeforeTheClearIsAnnounced)
{
    writtenTextBox({ 20, 100 });
    std::vector<std::size_t> subviews;
    auto &center = platform::NotificationCenter::defaultCenter();
    center.addObserver(this, penwickNotificationKey(),
        [this, &subviews](const auto &) { subviews.push_back(canvas->subviews().size()); });

    controller->didClearCanvas();
    center.removeObserver(this);

    EXPECT_EQ(subviews, (std::vector<std::size_t> { 0, 0, 0 }));
}

} // namespace
} // namespace penwick::test
