// SPDX-License-Identifier: MIT
// Undo of what was drawn or erased, with every notification in its order.
#include "history/UndoRedoManagerFixture.h"

namespace penwick::test {
namespace {

TEST_F(UndoRedoManagerTest, undoOfAnEmptyHistoryDoesNothing)
{
    manager.undoAction();

    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(manager.undoCount(), 0);
}

TEST_F(UndoRedoManagerTest, undoOfTheOnlyStrokePostsRedoThenUndoThenRedraw)
{
    drawStrokes(1);

    manager.undoAction();

    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "enableUndo false", "redraw" }));
    EXPECT_EQ(strokes(), Ids());
    EXPECT_EQ(idsOf(manager.undoStack()), Ids());
    EXPECT_EQ(idsOf(manager.redoStack()), Ids { 1 });
    EXPECT_EQ(manager.undoCount(), 1);
}

TEST_F(UndoRedoManagerTest, fifthUndoInARowDisablesUndoThoughRecordsRemainAndRedoEnablesIt)
{
    drawStrokes(7);
    for (int step = 1; step <= 4; ++step) {
        manager.undoAction();
        EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "redraw" })) << step;
    }

    manager.undoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo false", "enableRedo true", "redraw" }));
    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 1, 2 }));

    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo true", "redraw" }));
    EXPECT_EQ(manager.undoCount(), 0);
}

TEST_F(UndoRedoManagerTest, sixthUndoIsDoneAllTheSame)
{
    drawStrokes(7);
    for (int step = 1; step <= 5; ++step)
        manager.undoAction();
    static_cast<void>(recorder.take());

    manager.undoAction();

    EXPECT_EQ(recorder.take(), (Posts { "redraw" })); // six on the redo stack: nothing to post
    EXPECT_EQ(strokes(), Ids { 1 });
    EXPECT_EQ(manager.undoCount(), 6);
}

TEST_F(UndoRedoManagerTest, redoStackBeyondFivePostsAgainOnlyWhenItShrinksBack)
{
    drawStrokes(8);
    for (int step = 1; step <= 7; ++step)
        manager.undoAction();
    static_cast<void>(recorder.take());

    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "redraw" })); // six are left
    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo true", "redraw" }));
    manager.redoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo true", "redraw" }));
}

TEST_F(UndoRedoManagerTest, undoOfADrawnTextBoxTakesItOffTheCanvasAndRedrawsTwice)
{
    const UndoRedoState record = textBoxRecord(ActionType::draw, 9);
    putOnCanvas(record);
    manager.pushUndo(record);

    manager.undoAction();

    EXPECT_EQ(recorder.take(),
        (Posts { "removeWithId 9", "redraw", "enableRedo true", "enableUndo false", "redraw" }));
    EXPECT_EQ(textBoxes(), Ids());
}

TEST_F(UndoRedoManagerTest, undoneTextBoxStaysAliveOnTheRedoStack)
{
    std::weak_ptr<TnTextBox> box;
    {
        const UndoRedoState record = textBoxRecord(ActionType::draw, 9);
        box = std::get<TextBoxEntry>(record.element).textBox;
        putOnCanvas(record);
        manager.pushUndo(record);
    }

    manager.undoAction();
    EXPECT_FALSE(box.expired());

    manager.redoAction();
    EXPECT_EQ(content->textBoxArray().last().textBox, box.lock());
}

TEST_F(UndoRedoManagerTest, undoneTextBoxDiesWhenItCanNoLongerBeRedone)
{
    std::weak_ptr<TnTextBox> box;
    {
        const UndoRedoState record = textBoxRecord(ActionType::draw, 9);
        box = std::get<TextBoxEntry>(record.element).textBox;
        putOnCanvas(record);
        manager.pushUndo(record);
    }
    manager.undoAction();

    manager.setRedoStack({});

    EXPECT_TRUE(box.expired());
}

TEST_F(UndoRedoManagerTest, undoOfWhatIsNoLongerThereMovesTheRecordAndRedrawsOnce)
{
    manager.pushUndo(strokeRecord(ActionType::draw, 1));
    manager.pushUndo(textBoxRecord(ActionType::draw, 2));

    manager.undoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "redraw" }));
    manager.undoAction();
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "enableUndo false", "redraw" }));

    EXPECT_EQ(idsOf(manager.redoStack()), (Ids { 2, 1 }));
}

TEST_F(UndoRedoManagerTest, undoOfADrawRemovesTheFirstEntryOfThatIdentifier)
{
    const UndoRedoState first = strokeRecord(ActionType::draw, 1);
    const UndoRedoState second = strokeRecord(ActionType::draw, 1);
    putOnCanvas(first);
    putOnCanvas(strokeRecord(ActionType::draw, 2));
    putOnCanvas(second);
    manager.pushUndo(second);

    manager.undoAction();

    EXPECT_EQ(strokes(), (Ids { 2, 1 }));
    EXPECT_EQ(content->pathArray().last().bPath, std::get<StrokeEntry>(second.element).bPath);
}

TEST_F(UndoRedoManagerTest, undoOfAnErasedStrokePutsItAboveStrokesDrawnLater)
{
    drawStrokes(3);
    const UndoRedoState erased { content->pathArray()[0], ActionType::erase, 1 };
    EntryList<StrokeEntry> strokesLeft = content->pathArray();
    strokesLeft.removeAt(0);
    content->setPathArray(strokesLeft);
    manager.pushUndo(erased);

    manager.undoAction();

    EXPECT_EQ(strokes(), (Ids { 2, 3, 1 }));
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "redraw" }));
}

TEST_F(UndoRedoManagerTest, undoOfAnErasedTextBoxPutsTheSameBoxBackWithoutASubviewOperation)
{
    const UndoRedoState record = textBoxRecord(ActionType::erase, 4);
    putOnCanvas(textBoxRecord(ActionType::draw, 5));
    manager.pushUndo(record);

    manager.undoAction();

    EXPECT_EQ(textBoxes(), (Ids { 5, 4 }));
    EXPECT_EQ(
        content->textBoxArray().last().textBox, std::get<TextBoxEntry>(record.element).textBox);
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "enableUndo false", "redraw" }));
}

} // namespace
} // namespace penwick::test
