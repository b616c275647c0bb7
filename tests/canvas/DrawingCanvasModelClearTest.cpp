// SPDX-License-Identifier: MIT
// Clearing, and its undo and redo: the arrays, the history and all that is posted.
#include "canvas/DrawingCanvasModelFixture.h"

#include "history/NotificationNames.h"

#include <penwick/platform/NotificationCenter.h>

namespace penwick::test {
namespace {

TEST_F(DrawingCanvasModelTest, clearLeavesOneRecordForEachStrokeThenEachTextBox)
{
    const std::int64_t box = addTextBox();
    const Ids strokes { drawLine(), drawLine(), drawLine() };
    static_cast<void>(recorder.take());

    model->clearCanvas();

    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableRedo false", "enableUndo true" }));
    EXPECT_TRUE(model->pathArray().isEmpty());
    EXPECT_TRUE(model->textBoxArray().isEmpty());
    EXPECT_EQ(doneOf(history->undoStack()),
        (Done { { ActionType::clear, strokes[0] }, { ActionType::clear, strokes[1] },
            { ActionType::clear, strokes[2] }, { ActionType::clear, box } }));
}

TEST_F(DrawingCanvasModelTest, contentIsStillThereWhileAClearIsAnnounced)
{
    drawLine();
    std::vector<std::pair<int, int>> strokesAndRecords;
    auto &center = platform::NotificationCenter::defaultCenter();
    center.addObserver(this, penwickNotificationKey(), [this, &strokesAndRecords](const auto &) {
        strokesAndRecords.emplace_back(model->pathArray().size(), history->undoStack().size());
    });

    model->clearCanvas();
    center.removeObserver(this);

    EXPECT_EQ(
        strokesAndRecords, (std::vector<std::pair<int, int>> { { 1, 1 }, { 1, 0 }, { 1, 1 } }));
}

TEST_F(DrawingCanvasModelTest, clearOfAnEmptyCanvasEndsWithUndoOfferedThoughUndoDoesNothing)
{
    model->clearCanvas();

    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableRedo false", "enableUndo true" }));
    EXPECT_TRUE(history->undoStack().isEmpty());
    EXPECT_TRUE(history->redoStack().isEmpty());

    history->undoAction();
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasModelTest, undoOfAClearRestoresStrokesAndBoxesInReverseAndRedoEmptiesAgain)
{
    const Ids strokes { drawLine(), drawLine(), drawLine() };
    const std::int64_t box = addTextBox();
    model->clearCanvas();
    static_cast<void>(recorder.take());

    history->undoAction();
    EXPECT_EQ(idsOf(model->pathArray()), (Ids { strokes[2], strokes[1], strokes[0] }));
    EXPECT_EQ(idsOf(model->textBoxArray()), Ids { box });
    EXPECT_EQ(recorder.take(),
        (Posts { "enableRedo true", "enableRedo true", "enableRedo true", "enableRedo true",
            "enableUndo false", "redraw" }));

    history->redoAction();
    EXPECT_TRUE(model->pathArray().isEmpty());
    EXPECT_TRUE(model->textBoxArray().isEmpty());
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo true", "enableRedo true", "enableRedo true",
            "removeWithId " + std::to_string(box), "redraw", "enableRedo false", "redraw" }));
}

TEST_F(DrawingCanvasModelTest, strokeAfterAClearEmptiesTheUndoStackFirst)
{
    drawLine();
    model->clearCanvas();
    static_cast<void>(recorder.take());

    const std::int64_t stroke = drawLine();

    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableUndo true", "enableRedo false" }));
    EXPECT_EQ(doneOf(history->undoStack()), (Done { { ActionType::draw, stroke } }));
}

TEST_F(DrawingCanvasModelTest, textBoxAfterAClearEmptiesTheUndoStackFirst)
{
    drawLine();
    model->clearCanvas();
    static_cast<void>(recorder.take());

    const std::int64_t box = addTextBox();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo false", "enableUndo true" }));
    EXPECT_EQ(doneOf(history->undoStack()), (Done { { ActionType::draw, box } }));
}

// What redo by position does to a box that was added after an undone clear.
TEST_F(DrawingCanvasModelTest, redoOfAClearDropsTheNewestBoxesEntryAndNamesTheClearedBox)
{
    const std::int64_t cleared = addTextBox();
    model->clearCanvas();
    history->undoAction();
    const std::int64_t added = addTextBox();
    ASSERT_EQ(idsOf(model->textBoxArray()), (Ids { cleared, added }));
    static_cast<void>(recorder.take());

    history->redoAction();

    EXPECT_EQ(idsOf(model->textBoxArray()), Ids { cleared });
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "removeWithId " + std::to_string(cleared), "redraw",
            "enableRedo false", "redraw" }));
}

} // namespace
} // namespace penwick::test
