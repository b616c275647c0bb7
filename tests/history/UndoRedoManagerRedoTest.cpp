// SPDX-License-Identifier: MIT
// Redo of what was drawn or erased, with every notification in its order.
#include "history/UndoRedoManagerFixture.h"

namespace penwick::test {
namespace {

TEST_F(UndoRedoManagerTest, redoOfNothingDoesNothing)
{
    manager.setUndoCount(3);

    manager.redoAction();

    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(manager.undoCount(), 3);
}

TEST_F(UndoRedoManagerTest, redoOfADrawAppendsAndPostsUndoThenRedoThenRedraw)
{
    manager.setRedoStack(stackOf({ strokeRecord(ActionType::draw, 1) }));
    putOnCanvas(strokeRecord(ActionType::draw, 2));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(strokes(), (Ids { 2, 1 }));
    EXPECT_EQ(idsOf(manager.undoStack()), Ids { 1 });
}

TEST_F(UndoRedoManagerTest, redoOfADrawnTextBoxAppendsItWithoutASubviewOperation)
{
    manager.setRedoStack(stackOf({ textBoxRecord(ActionType::draw, 1) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(textBoxes(), Ids { 1 });
}

TEST_F(UndoRedoManagerTest, redoOfAnErasedStrokeRemovesItWhereverItIs)
{
    drawStrokes(3);
    manager.setRedoStack(stackOf({ strokeRecord(ActionType::erase, 2) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(strokes(), (Ids { 1, 3 }));
}

TEST_F(UndoRedoManagerTest, redoOfAnErasedTextBoxTakesItOffTheCanvasAndRedrawsTwice)
{
    putOnCanvas(textBoxRecord(ActionType::draw, 1));
    putOnCanvas(textBoxRecord(ActionType::draw, 2));
    manager.setRedoStack(stackOf({ textBoxRecord(ActionType::erase, 1) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "removeWithId 1", "redraw", "enableRedo false", "redraw" }));
    EXPECT_EQ(textBoxes(), Ids { 2 });
}

TEST_F(UndoRedoManagerTest, redoOfAnEraseLeavesTheClearBelowItToTheNextRedo)
{
    drawStrokes(2);
    manager.setRedoStack(
        stackOf({ strokeRecord(ActionType::clear, 1), strokeRecord(ActionType::erase, 2) }));

    manager.redoAction();

    EXPECT_EQ(strokes(), Ids { 1 });
    EXPECT_EQ(idsOf(manager.redoStack()), Ids { 1 });
}

TEST_F(UndoRedoManagerTest, redoOfAnEraseOfWhatIsGoneMovesTheRecordAndRedrawsOnce)
{
    manager.setRedoStack(
        stackOf({ strokeRecord(ActionType::erase, 1), textBoxRecord(ActionType::erase, 2) }));
    static_cast<void>(recorder.take());

    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo true", "redraw" }));
    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 2, 1 }));
}

} // namespace
} // namespace penwick::test
