// SPDX-License-Identifier: MIT
// Undo and redo of a whole clear, with every notification in its order.
#include "history/UndoRedoManagerFixture.h"

namespace penwick::test {
namespace {

TEST_F(UndoRedoManagerTest, undoOfAClearRestoresInReverseOrderAndRedoRemovesFromTheEnd)
{
    for (int identifier = 1; identifier <= 3; ++identifier)
        manager.pushUndo(strokeRecord(ActionType::clear, identifier));

    manager.undoAction();
    EXPECT_EQ(strokes(), (Ids { 3, 2, 1 }));
    EXPECT_EQ(recorder.take(),
        (Posts { "enableRedo true", "enableRedo true", "enableRedo true", "enableUndo false",
            "redraw" }));
    EXPECT_EQ(idsOf(manager.redoStack()), (Ids { 3, 2, 1 }));
    EXPECT_EQ(manager.undoCount(), 1);

    std::vector<Ids> whilePosting;
    const Onlooker onlooker([&] { whilePosting.push_back(strokes()); });
    manager.redoAction();
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo true", "enableRedo true", "enableRedo false",
            "redraw" }));
    EXPECT_EQ(whilePosting, (std::vector<Ids> { { 3, 2, 1 }, { 3, 2 }, { 3 }, {}, {} }));
    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 1, 2, 3 }));
}

TEST_F(UndoRedoManagerTest, undoOfAClearReplacesWhatIsOnTheCanvasNow)
{
    putOnCanvas(strokeRecord(ActionType::draw, 7));
    putOnCanvas(textBoxRecord(ActionType::draw, 8));
    manager.pushUndo(strokeRecord(ActionType::clear, 1));

    manager.undoAction();

    EXPECT_EQ(strokes(), Ids { 1 });
    EXPECT_EQ(textBoxes(), Ids());
}

TEST_F(UndoRedoManagerTest, undoOfAClearStopsAtTheFirstOtherRecord)
{
    manager.pushUndo(strokeRecord(ActionType::clear, 1));
    manager.pushUndo(strokeRecord(ActionType::draw, 2));
    manager.pushUndo(strokeRecord(ActionType::clear, 3));
    manager.pushUndo(textBoxRecord(ActionType::clear, 4));

    manager.undoAction();

    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 1, 2 }));
    EXPECT_EQ(idsOf(manager.redoStack()), (Ids { 4, 3 }));
    EXPECT_EQ(strokes(), Ids { 3 });
    EXPECT_EQ(textBoxes(), Ids { 4 });
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "enableRedo true", "redraw" }));
}

TEST_F(UndoRedoManagerTest, undoAfterClearRestoresEveryOneOfTenThousandStrokes)
{
    constexpr int count = 10'000;
    for (int identifier = 1; identifier <= count; ++identifier)
        manager.pushUndo(strokeRecord(ActionType::clear, identifier));

    manager.undoAction();

    EXPECT_EQ(content->pathArray().size(), count);
    EXPECT_EQ(content->pathArray().first().pathId, count);
    EXPECT_EQ(recorder.take(),
        (Posts { "enableRedo true", "enableRedo true", "enableRedo true", "enableRedo true",
            "enableRedo true", "enableUndo false", "redraw" }));

    manager.redoAction();

    EXPECT_TRUE(content->pathArray().isEmpty());
    EXPECT_EQ(manager.undoStack().size(), count);
}

TEST_F(UndoRedoManagerTest, copyOfTheArraysTakenWhilePostingKeepsWhatItWas)
{
    for (int identifier = 1; identifier <= 3; ++identifier)
        manager.pushUndo(strokeRecord(ActionType::clear, identifier));
    std::vector<EntryList<StrokeEntry>> copies;
    const Onlooker onlooker([&] { copies.push_back(content->pathArray()); });

    manager.undoAction();
    manager.redoAction();

    std::vector<int> sizes;
    for (const auto &copy : copies)
        sizes.push_back(copy.size());
    EXPECT_EQ(sizes, (std::vector<int> { 1, 2, 3, 3, 3, 3, 2, 1, 0, 0 }));
}

TEST_F(UndoRedoManagerTest, redoOfAClearTakesTextBoxesOffTheCanvasOneByOne)
{
    manager.pushUndo(strokeRecord(ActionType::clear, 1));
    manager.pushUndo(textBoxRecord(ActionType::clear, 2));
    manager.pushUndo(textBoxRecord(ActionType::clear, 3));
    manager.undoAction();
    ASSERT_EQ(textBoxes(), (Ids { 3, 2 }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo true", "removeWithId 2", "redraw",
            "enableRedo true", "removeWithId 3", "redraw", "enableRedo false", "redraw" }));
    EXPECT_EQ(strokes(), Ids());
    EXPECT_EQ(textBoxes(), Ids());
    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 1, 2, 3 }));
}

TEST_F(UndoRedoManagerTest, redoOfAClearGoesByPositionSoABoxAddedMeanwhileLosesItsPlace)
{
    manager.pushUndo(textBoxRecord(ActionType::clear, 1));
    manager.undoAction();
    putOnCanvas(textBoxRecord(ActionType::draw, 2));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(textBoxes(), Ids { 1 }); // the entry of 2 went, though 1 is what leaves the canvas
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "removeWithId 1", "redraw", "enableRedo false", "redraw" }));
}

TEST_F(UndoRedoManagerTest, redoOfAClearedStrokeWithoutStrokesRemovesATextBoxInstead)
{
    putOnCanvas(textBoxRecord(ActionType::draw, 2));
    manager.setRedoStack(stackOf({ strokeRecord(ActionType::clear, 1) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(textBoxes(), Ids());
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "removeWithId 1", "redraw", "enableRedo false", "redraw" }));
}

TEST_F(UndoRedoManagerTest, redoOfAClearOnAnEmptyCanvasOnlyMovesTheRecords)
{
    manager.setRedoStack(
        stackOf({ textBoxRecord(ActionType::clear, 2), strokeRecord(ActionType::clear, 1) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo true", "enableRedo false", "redraw" }));
    EXPECT_EQ(idsOf(manager.undoStack()), (Ids { 1, 2 }));
}

TEST_F(UndoRedoManagerTest, redoOfAClearStopsAtTheFirstOtherRecord)
{
    putOnCanvas(strokeRecord(ActionType::draw, 1));
    putOnCanvas(strokeRecord(ActionType::draw, 2));
    manager.setRedoStack(
        stackOf({ strokeRecord(ActionType::draw, 3), strokeRecord(ActionType::clear, 2) }));
    static_cast<void>(recorder.take());

    manager.redoAction();

    EXPECT_EQ(strokes(), Ids { 1 });
    EXPECT_EQ(idsOf(manager.redoStack()), Ids { 3 });
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo true", "redraw" }));
}

} // namespace
} // namespace penwick::test
