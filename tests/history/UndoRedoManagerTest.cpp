// SPDX-License-Identifier: MIT
// The properties of the history, records it cannot use, and what stops the process.
#include "history/UndoRedoManagerFixture.h"

#include <limits>

namespace penwick::test {
namespace {

TEST_F(UndoRedoManagerTest, newHistoryIsEmptyAndPostsNothing)
{
    const UndoRedoManager fresh;

    EXPECT_TRUE(fresh.undoStack().isEmpty());
    EXPECT_TRUE(fresh.redoStack().isEmpty());
    EXPECT_EQ(fresh.undoCount(), 0);
    EXPECT_EQ(fresh.drawingCanvasModel(), nullptr);
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(UndoRedoManagerTest, actionTypesKeepTheirStoredCodes)
{
    EXPECT_EQ(static_cast<int>(ActionType::draw), 0);
    EXPECT_EQ(static_cast<int>(ActionType::erase), 1);
    EXPECT_EQ(static_cast<int>(ActionType::clear), 2);
    EXPECT_EQ(static_cast<int>(ActionType::undo), 3);
    EXPECT_EQ(static_cast<int>(ActionType::redo), 4);
}

TEST_F(UndoRedoManagerTest, emptyUndoStackPostsAtEveryAssignmentBeforeItIsStored)
{
    manager.setUndoStack(stackOf({ strokeRecord(ActionType::draw, 1) }));
    manager.pushUndo(strokeRecord(ActionType::draw, 2));
    EXPECT_EQ(recorder.take(), Posts());

    int sizeWhilePosting = -1;
    const Onlooker onlooker([&] { sizeWhilePosting = manager.undoStack().size(); });
    manager.setUndoStack({});
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo false" }));
    EXPECT_EQ(sizeWhilePosting, 2);
    EXPECT_TRUE(manager.undoStack().isEmpty());

    manager.setUndoStack({});
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo false" }));
}

TEST_F(UndoRedoManagerTest, redoStackPostsByItsNewSizeAfterItIsStored)
{
    std::vector<UndoRedoState> records;
    Posts posted;
    std::vector<int> sizesWhilePosting;
    const Onlooker onlooker([&] { sizesWhilePosting.push_back(manager.redoStack().size()); });

    for (int size = 0; size <= 7; ++size) {
        manager.setRedoStack(stackOf(records));
        const Posts posts = recorder.take();
        posted.push_back(posts.size() == 1 ? posts.front() : std::to_string(posts.size()));
        records.push_back(strokeRecord(ActionType::draw, size));
    }

    EXPECT_EQ(posted,
        (Posts { "enableRedo false", "enableRedo true", "enableRedo true", "enableRedo true",
            "enableRedo true", "enableRedo true", "0", "0" }));
    EXPECT_EQ(sizesWhilePosting, (std::vector<int> { 0, 1, 2, 3, 4, 5 }));
}

TEST_F(UndoRedoManagerTest, undoCountPostsForNoughtAndExactlyFiveBeforeItIsStored)
{
    manager.setUndoCount(7);
    std::vector<std::int64_t> countsWhilePosting;
    const Onlooker onlooker([&] { countsWhilePosting.push_back(manager.undoCount()); });

    for (const std::int64_t count : { 1, 4, 5, 6, -5, 0, 0 })
        manager.setUndoCount(count);

    EXPECT_EQ(
        recorder.take(), (Posts { "enableUndo false", "enableUndo true", "enableUndo true" }));
    EXPECT_EQ(countsWhilePosting, (std::vector<std::int64_t> { 4, -5, 0 }));
}

class UnusableRecord : public UndoRedoManagerTest, public ::testing::WithParamInterface<ActionType>
{ };

TEST_P(UnusableRecord, everyUndoPrintsAndCountsAndLeavesTheRecord)
{
    manager.pushUndo(strokeRecord(GetParam(), 1));

    for (int step = 1; step <= 6; ++step) {
        ::testing::internal::CaptureStdout();
        manager.undoAction();
        EXPECT_EQ(::testing::internal::GetCapturedStdout(), "Undo Not Available!\n");
        EXPECT_EQ(manager.undoCount(), step);
        EXPECT_EQ(recorder.take(), step == 5 ? Posts { "enableUndo false" } : Posts());
    }

    EXPECT_EQ(idsOf(manager.undoStack()), Ids { 1 });
    EXPECT_TRUE(manager.redoStack().isEmpty());
}

TEST_P(UnusableRecord, redoPrintsTheSameAndStillResetsTheCount)
{
    manager.setRedoStack(stackOf({ strokeRecord(GetParam(), 1) }));
    manager.setUndoCount(3);
    static_cast<void>(recorder.take());

    ::testing::internal::CaptureStdout();
    manager.redoAction();

    EXPECT_EQ(::testing::internal::GetCapturedStdout(), "Undo Not Available!\n");
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true" }));
    EXPECT_EQ(manager.undoCount(), 0);
    EXPECT_EQ(idsOf(manager.redoStack()), Ids { 1 });
    EXPECT_TRUE(manager.undoStack().isEmpty());
}

TEST_P(UnusableRecord, needsNoCanvasModel)
{
    manager.pushUndo(strokeRecord(GetParam(), 1));
    manager.setDrawingCanvasModel({});

    ::testing::internal::CaptureStdout();
    manager.undoAction();

    EXPECT_EQ(::testing::internal::GetCapturedStdout(), "Undo Not Available!\n");
}

INSTANTIATE_TEST_SUITE_P(
    UndoRedoManager, UnusableRecord, ::testing::Values(ActionType::undo, ActionType::redo));

using UndoRedoManagerDeathTest = UndoRedoManagerTest;

TEST_F(UndoRedoManagerDeathTest, commandWithoutItsCanvasModelStopsTheProcess)
{
    for (const ActionType action : { ActionType::draw, ActionType::erase, ActionType::clear }) {
        manager.setUndoStack(stackOf({ strokeRecord(action, 1) }));
        manager.setRedoStack(stackOf({ strokeRecord(action, 1) }));
        content.reset();
        const char *const message = "^penwick: fatal error: the history's canvas model is gone\n$";

        EXPECT_DEATH(manager.undoAction(), message);
        EXPECT_DEATH(manager.redoAction(), message);
    }
}

TEST_F(UndoRedoManagerDeathTest, overflowOfTheUndoCountStopsTheProcess)
{
    drawStrokes(1);
    manager.setUndoCount(std::numeric_limits<std::int64_t>::max());

    EXPECT_DEATH(
        manager.undoAction(), "^penwick: fatal error: the number of undo steps overflows\n$");
}

TEST_F(UndoRedoManagerTest, historyDoesNotKeepItsCanvasModelAlive)
{
    const std::weak_ptr<TestContent> model = content;
    EXPECT_EQ(manager.drawingCanvasModel(), content);

    content.reset();

    EXPECT_TRUE(model.expired());
    EXPECT_EQ(manager.drawingCanvasModel(), nullptr);
}

} // namespace
} // namespace penwick::test
