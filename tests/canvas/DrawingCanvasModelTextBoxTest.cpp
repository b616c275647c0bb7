// SPDX-License-Identifier: MIT
// Text boxes on the model: the arrays, the history and all that is posted.
#include "canvas/DrawingCanvasModelFixture.h"

namespace penwick::test {
namespace {

TEST_F(DrawingCanvasModelTest, newTextBoxStandsAroundTheClickedPointAndKnowsItsOwner)
{
    model->createTextBox({ 50, 60 }, Qt::red, 24.0, &owner);

    ASSERT_EQ(model->textBoxArray().size(), 1);
    const TextBoxEntry &entry = model->textBoxArray().last();
    EXPECT_EQ(entry.textId, entry.textBox->hash());
    EXPECT_EQ(entry.textBox->frame(), (platform::Rect { 50, 36, 200, 30 }));
    EXPECT_EQ(entry.textBox->textBoxDelegate(), &owner);
    EXPECT_EQ(entry.textBox->widget().parentWidget(), nullptr);
}

TEST_F(DrawingCanvasModelTest, newTextBoxIsRecordedAndLeavesWhatCouldBeRedone)
{
    makeSomethingRedoable();

    const std::int64_t box = addTextBox();

    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true" }));
    EXPECT_EQ(doneOf(history->undoStack()), (Done { { ActionType::draw, box } }));
    EXPECT_EQ(history->redoStack().size(), 1);
    EXPECT_EQ(history->undoCount(), 0);
}

TEST_F(DrawingCanvasModelTest, deletedTextBoxIsRecordedAndPostsNothing)
{
    const std::int64_t kept = addTextBox();
    const std::int64_t deleted = addTextBox();
    drawLine({ 0, 0 });
    history->undoAction();
    static_cast<void>(recorder.take());

    model->deleteTextBoxWith(deleted);

    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(idsOf(model->textBoxArray()), Ids { kept });
    EXPECT_EQ(history->undoStack().last().actionAssociated, ActionType::erase);
    EXPECT_EQ(history->undoStack().last().elementId, deleted);
    EXPECT_EQ(history->undoStack().size(), 3);
    EXPECT_EQ(history->undoCount(), 1);
    EXPECT_EQ(history->redoStack().size(), 1);
}

TEST_F(DrawingCanvasModelTest, deletingAnUnknownTextBoxChangesAndPostsNothing)
{
    model->deleteTextBoxWith(1);
    const std::int64_t box = addTextBox();
    static_cast<void>(recorder.take());

    model->deleteTextBoxWith(box + 1'000'000);

    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(idsOf(model->textBoxArray()), Ids { box });
    EXPECT_EQ(history->undoStack().size(), 1);
}

TEST_F(DrawingCanvasModelTest, deletionOnTopOfAClearedGroupKeepsTheGroup)
{
    const std::int64_t stroke = drawLine();
    const std::int64_t cleared = addTextBox();
    model->clearCanvas();
    history->undoAction();
    const std::int64_t added = addTextBox();
    history->undoAction();
    history->redoAction();
    history->redoAction();
    ASSERT_EQ(history->undoStack().last().actionAssociated, ActionType::clear);
    // redo by position took the entry of the added box, so the cleared one is still there
    ASSERT_EQ(idsOf(model->textBoxArray()), Ids { cleared });

    model->deleteTextBoxWith(cleared);

    EXPECT_EQ(doneOf(history->undoStack()),
        (Done { { ActionType::draw, added }, { ActionType::clear, stroke },
            { ActionType::clear, cleared }, { ActionType::erase, cleared } }));
}

TEST_F(DrawingCanvasModelTest, twoBoxesAliveNeverShareAHashSoDeletingOneKeepsTheOther)
{
    const std::int64_t first = addTextBox();
    const std::int64_t second = addTextBox();
    ASSERT_NE(first, second);

    model->deleteTextBoxWith(first);

    EXPECT_EQ(idsOf(model->textBoxArray()), Ids { second });
}

TEST_F(DrawingCanvasModelTest, undoOfADeletionBringsBackTheSameBoxWithTheSameHash)
{
    const std::int64_t box = addTextBox();
    const TnTextBox *const object = model->textBoxArray().last().textBox.get();
    model->deleteTextBoxWith(box);

    history->undoAction();

    ASSERT_EQ(idsOf(model->textBoxArray()), Ids { box });
    EXPECT_EQ(model->textBoxArray().last().textBox.get(), object);
    EXPECT_EQ(object->hash(), box);
}

TEST_F(DrawingCanvasModelTest, textBoxLivesAsLongAsARecordHoldsIt)
{
    const std::int64_t box = addTextBox();
    const std::weak_ptr<TnTextBox> object = model->textBoxArray().last().textBox;

    model->deleteTextBoxWith(box);
    EXPECT_FALSE(object.expired());

    model->clearCanvas();
    EXPECT_TRUE(object.expired());
}

} // namespace
} // namespace penwick::test
