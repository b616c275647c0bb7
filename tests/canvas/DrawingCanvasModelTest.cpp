// SPDX-License-Identifier: MIT
// Strokes and erasing: the arrays, the history and all that is posted; and what stops the process.
#include "canvas/DrawingCanvasModelFixture.h"

#include "history/NotificationNames.h"

#include <penwick/platform/NotificationCenter.h>

namespace penwick::test {
namespace {

template <class Content>
concept letsItsArraysBeAssigned
    = requires(Content &content, EntryList<StrokeEntry> strokes, EntryList<TextBoxEntry> boxes)
{
    content.setPathArray(strokes);
    content.setTextBoxArray(boxes);
};

TEST(DrawingCanvasModelContract, onlyTheHistorySeesArraysThatItMayAssign)
{
    EXPECT_TRUE(letsItsArraysBeAssigned<CanvasContent>);
    EXPECT_FALSE(letsItsArraysBeAssigned<DrawingCanvasModel>);
}

TEST_F(DrawingCanvasModelTest, newModelIsEmptyAndHasNoHistory)
{
    const DrawingCanvasModel fresh;

    EXPECT_TRUE(fresh.pathArray().isEmpty());
    EXPECT_TRUE(fresh.textBoxArray().isEmpty());
    EXPECT_EQ(fresh.undoRedoManager(), nullptr);
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasModelTest, modelAndHistoryDoNotKeepEachOtherAlive)
{
    const std::weak_ptr<DrawingCanvasModel> weakModel = model;
    const std::weak_ptr<UndoRedoManager> weakHistory = history;

    history.reset();
    EXPECT_FALSE(weakHistory.expired());
    model.reset();

    EXPECT_TRUE(weakModel.expired());
    EXPECT_TRUE(weakHistory.expired());
}

TEST_F(DrawingCanvasModelTest, newStrokeHasRoundEndsItsWidthAndColourAndNoElements)
{
    model->createPathWithParam(QColor(1, 2, 3, 178), 7.5, { 4, 5 });

    ASSERT_EQ(model->pathArray().size(), 1);
    const StrokeEntry &entry = model->pathArray().first();
    EXPECT_EQ(entry.bPath->elementCount(), 0);
    EXPECT_EQ(entry.bPath->lineWidth(), 7.5);
    EXPECT_EQ(entry.bPath->lineCapStyle(), platform::LineCapStyle::Round);
    EXPECT_EQ(entry.bPath->lineJoinStyle(), platform::LineJoinStyle::Round);
    EXPECT_EQ(entry.bPathParams.startPoint, (Point { 4, 5 }));
    EXPECT_EQ(entry.bPathParams.endPoint, std::nullopt);
    EXPECT_EQ(entry.bPathParams.pathColor, QColor(1, 2, 3, 178));
    EXPECT_EQ(entry.pathId, entry.bPath->hash());
}

TEST_F(DrawingCanvasModelTest, newStrokePostsUndoThenNoRedoAndIsOneRecord)
{
    const std::int64_t stroke = drawLine();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));
    EXPECT_EQ(doneOf(history->undoStack()), (Done { { ActionType::draw, stroke } }));
    EXPECT_EQ(std::get<StrokeEntry>(history->undoStack().last().element).bPath,
        model->pathArray().last().bPath);
}

TEST_F(DrawingCanvasModelTest, undoIsOfferedBeforeTheNewRecordIsThere)
{
    std::vector<std::pair<int, int>> strokesAndRecords;
    auto &center = platform::NotificationCenter::defaultCenter();
    center.addObserver(this, penwickNotificationKey(), [this, &strokesAndRecords](const auto &) {
        strokesAndRecords.emplace_back(model->pathArray().size(), history->undoStack().size());
    });

    drawLine();
    center.removeObserver(this);

    EXPECT_EQ(strokesAndRecords, (std::vector<std::pair<int, int>> { { 1, 0 }, { 1, 1 } }));
}

TEST_F(DrawingCanvasModelTest, newStrokeAfterUndoStepsStartsCountingAnew)
{
    drawLine();
    drawLine();
    history->undoAction();
    ASSERT_EQ(history->undoCount(), 1);

    drawLine();

    EXPECT_EQ(history->undoCount(), 0);
}

TEST_F(DrawingCanvasModelTest, strokeOrEraseEmptiesWhatCouldBeRedone)
{
    makeSomethingRedoable();
    ASSERT_EQ(history->redoStack().size(), 1);
    drawLine();
    EXPECT_TRUE(history->redoStack().isEmpty());

    makeSomethingRedoable();
    ASSERT_EQ(history->redoStack().size(), 1);
    ASSERT_TRUE(model->performEraseOperationAtLocation({ 50, 0 }));
    EXPECT_TRUE(history->redoStack().isEmpty());
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));
}

TEST_F(DrawingCanvasModelTest, everySegmentIsASubpathOfItsOwnFromWhereTheLastOneEnded)
{
    model->createPathWithParam(Qt::black, 5.0, { 1, 2 });
    static_cast<void>(recorder.take());

    model->updateTheCurrentPath({ 3, 4 });
    model->updateTheCurrentPath({ 5, 6 });

    const StrokeEntry &entry = model->pathArray().last();
    ASSERT_EQ(entry.bPath->elementCount(), 4);
    const std::pair<Kind, Point> expected[] = { { Kind::MoveTo, { 1, 2 } },
        { Kind::LineTo, { 3, 4 } }, { Kind::MoveTo, { 3, 4 } }, { Kind::LineTo, { 5, 6 } } };
    for (int index = 0; index < 4; ++index) {
        EXPECT_EQ(entry.bPath->elementAtIndex(index).kind, expected[index].first) << index;
        EXPECT_EQ(entry.bPath->elementAtIndex(index).points[0], expected[index].second) << index;
    }
    EXPECT_EQ(entry.bPathParams.startPoint, (Point { 5, 6 }));
    EXPECT_EQ(entry.bPathParams.endPoint, std::nullopt);
    EXPECT_EQ(history->undoStack().size(), 1);
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasModelTest, updateWithoutStrokesDoesNothing)
{
    model->updateTheCurrentPath({ 1, 1 });

    EXPECT_TRUE(model->pathArray().isEmpty());
    EXPECT_TRUE(history->undoStack().isEmpty());
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasModelTest, copyOfTheArrayKeepsItsStartPointWhileTheStrokeGoesOn)
{
    model->createPathWithParam(Qt::black, 5.0, { 1, 2 });
    const EntryList<StrokeEntry> copy = model->pathArray();

    model->updateTheCurrentPath({ 3, 4 });

    EXPECT_EQ(copy.last().bPathParams.startPoint, (Point { 1, 2 }));
    EXPECT_EQ(copy.last().bPath, model->pathArray().last().bPath); // the path itself is shared
}

TEST_F(DrawingCanvasModelTest, redrawnStrokeContinuesFromWhereItWasRecorded)
{
    const std::int64_t stroke = drawLine({ 10, 10 });

    history->undoAction();
    history->redoAction();

    ASSERT_EQ(idsOf(model->pathArray()), Ids { stroke });
    EXPECT_EQ(model->pathArray().last().bPathParams.startPoint, (Point { 10, 10 }));
    EXPECT_EQ(model->pathArray().last().bPath->elementCount(), 2);
}

TEST_F(DrawingCanvasModelTest, undoOfAStrokeKeepsItsPathAlive)
{
    drawLine();
    const std::weak_ptr<platform::BezierPath> path = model->pathArray().last().bPath;

    history->undoAction();
    EXPECT_FALSE(path.expired());

    drawLine(); // nothing can be redone any more
    EXPECT_TRUE(path.expired());
}

TEST_F(DrawingCanvasModelTest, strokeThatGrewWhileALaterOneWasUndoneIsErasedWhereItGrew)
{
    drawLine({ 0, 0 });
    drawLine({ 0, 50 });
    EXPECT_FALSE(model->performEraseOperationAtLocation({ 50, 20 }));
    history->undoAction();
    model->updateTheCurrentPath({ 100, 300 });
    history->redoAction();
    ASSERT_EQ(model->pathArray().size(), 2);

    EXPECT_TRUE(model->performEraseOperationAtLocation({ 100, 200 }));

    EXPECT_EQ(model->pathArray().size(), 1);
}

TEST_F(DrawingCanvasModelTest, eraseTakesTheOlderOfTwoStrokesThenTheNewer)
{
    const std::int64_t older = drawLine();
    const std::int64_t newer = drawLine();
    static_cast<void>(recorder.take());

    EXPECT_TRUE(model->performEraseOperationAtLocation({ 50, 2.5 }));
    EXPECT_EQ(idsOf(model->pathArray()), Ids { newer });
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));

    EXPECT_TRUE(model->performEraseOperationAtLocation({ 50, 2.5 }));
    EXPECT_EQ(idsOf(model->pathArray()), Ids());
    EXPECT_EQ(doneOf(history->undoStack()),
        (Done { { ActionType::draw, older }, { ActionType::draw, newer },
            { ActionType::erase, older }, { ActionType::erase, newer } }));
}

TEST_F(DrawingCanvasModelTest, eraseInTheMiddleMovesLaterStrokesDown)
{
    const std::int64_t first = drawLine({ 0, 0 });
    drawLine({ 0, 20 });
    const std::int64_t third = drawLine({ 0, 40 });

    EXPECT_TRUE(model->performEraseOperationAtLocation({ 50, 20 }));

    EXPECT_EQ(idsOf(model->pathArray()), (Ids { first, third }));
}

TEST_F(DrawingCanvasModelTest, erasedStrokeIsStillThereWhileItsRecordIsAnnounced)
{
    drawLine();
    std::vector<int> sizes;
    auto &center = platform::NotificationCenter::defaultCenter();
    center.addObserver(this, penwickNotificationKey(),
        [this, &sizes](const auto &) { sizes.push_back(model->pathArray().size()); });

    model->performEraseOperationAtLocation({ 50, 0 });
    center.removeObserver(this);

    EXPECT_EQ(sizes, (std::vector<int> { 1, 1 }));
    EXPECT_TRUE(model->pathArray().isEmpty());
}

TEST_F(DrawingCanvasModelTest, eraseOnAnEmptyCanvasOrEmptySpaceChangesAndPostsNothing)
{
    EXPECT_FALSE(model->performEraseOperationAtLocation({ 0, 0 }));
    EXPECT_EQ(recorder.take(), Posts());

    const std::int64_t stroke = drawLine();
    makeSomethingRedoable();
    EXPECT_FALSE(model->performEraseOperationAtLocation({ 50, 2.6 }));

    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(idsOf(model->pathArray()), Ids { stroke });
    EXPECT_EQ(history->undoStack().size(), 1);
    EXPECT_EQ(history->redoStack().size(), 1);
    EXPECT_EQ(history->undoCount(), 1);
}

TEST_F(DrawingCanvasModelTest, strokeOfOneClickHasNoElementsAndIsNotErased)
{
    model->createPathWithParam(Qt::black, 5.0, { 10, 10 });

    EXPECT_FALSE(model->performEraseOperationAtLocation({ 10, 10 }));
    EXPECT_EQ(model->pathArray().last().bPath->elementCount(), 0);
}

TEST_F(DrawingCanvasModelTest, strokeThatCameBackToItsStartIsADotAndIsErased)
{
    model->createPathWithParam(Qt::black, 5.0, { 10, 10 });
    model->updateTheCurrentPath({ 10, 10 });

    EXPECT_TRUE(model->performEraseOperationAtLocation({ 12.5, 10 }));
}

TEST_F(DrawingCanvasModelTest, undoneEraseLiesAboveStrokesDrawnBefore)
{
    const std::int64_t first = drawLine({ 0, 0 });
    const std::int64_t second = drawLine({ 0, 20 });
    model->performEraseOperationAtLocation({ 50, 0 });

    history->undoAction();

    EXPECT_EQ(idsOf(model->pathArray()), (Ids { second, first }));
}

using DrawingCanvasModelDeathTest = DrawingCanvasModelTest;

TEST_F(DrawingCanvasModelDeathTest, recordingWithoutAHistoryStopsTheProcess)
{
    drawLine();
    const std::int64_t box = addTextBox();
    model->setUndoRedoManager(nullptr);
    const char *const message = "penwick: fatal error: the canvas model has no history\n";

    EXPECT_DEATH(model->createPathWithParam(Qt::black, 5.0, { 0, 0 }), message);
    EXPECT_DEATH(model->performEraseOperationAtLocation({ 50, 0 }), message);
    EXPECT_DEATH(addTextBox(), message);
    EXPECT_DEATH(model->deleteTextBoxWith(box), message);
    EXPECT_DEATH(model->clearCanvas(), message);
}

TEST_F(DrawingCanvasModelTest, whatRecordsNothingNeedsNoHistory)
{
    drawLine();
    model->setUndoRedoManager(nullptr);

    model->updateTheCurrentPath({ 1, 1 });
    EXPECT_FALSE(model->performEraseOperationAtLocation({ 500, 500 }));
    model->deleteTextBoxWith(1);
}

TEST_F(DrawingCanvasModelDeathTest, strokeWithoutStartPointCannotGoOn)
{
    StrokeEntry entry;
    entry.bPath = std::make_shared<platform::BezierPath>();
    history->pushUndo({ entry, ActionType::erase, entry.pathId });
    history->undoAction();
    ASSERT_EQ(model->pathArray().size(), 1);

    EXPECT_DEATH(model->updateTheCurrentPath({ 1, 1 }),
        "penwick: fatal error: the newest stroke has no start point\n");
}

TEST_F(DrawingCanvasModelDeathTest, textBoxForAnythingButItsOwnerStopsTheProcess)
{
    QObject stranger;
    const char *const message
        = "penwick: fatal error: a text box's delegate is no owner of text boxes\n";

    EXPECT_DEATH(model->createTextBox({ 0, 0 }, Qt::red, 24.0, &stranger), message);
    EXPECT_DEATH(model->createTextBox({ 0, 0 }, Qt::red, 24.0, nullptr), message);
}

} // namespace
} // namespace penwick::test
