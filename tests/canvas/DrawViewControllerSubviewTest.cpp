// SPDX-License-Identifier: MIT
// Text boxes that leave a canvas: by themselves or because the history says so.
#include "canvas/CanvasFixture.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {
namespace {

using Case = SubviewOperation::Case;

constexpr QRect wholeCanvas { 0, 0, 300, 200 };

const QString undo = QStringLiteral("undo");

using DrawViewControllerSubviewTest = CanvasFixture;

// Text boxes that delete themselves

TEST_F(
    DrawViewControllerSubviewTest, boxThatDeletesItselfLeavesTheModelAndTheCanvasIsFirstResponder)
{
    const std::int64_t kept = placedTextBox({ 20, 160 });
    writtenTextBox({ 20, 100 });
    const auto box = model().textBoxArray().last().textBox;
    const std::int64_t id = box->hash();
    static_cast<void>(recorder.take());
    PaintRecorder painted(*canvas);

    box->deleteTextBox();

    EXPECT_EQ(idsOf(model().textBoxArray()), Ids { kept });
    EXPECT_EQ(idsOf(canvas->textBoxArray()), Ids { kept });
    EXPECT_EQ(contentOf(window).firstResponder(), contentOf(window).contentView());
    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_EQ(history().undoStack().last().elementId, id);
    EXPECT_EQ(history().undoStack().last().actionAssociated, ActionType::erase);
    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect> { wholeCanvas });
    EXPECT_EQ(box->superview(), nullptr); // the repaint does not bring it back
}

TEST_F(DrawViewControllerSubviewTest, undoOfADeletionBringsTheSameBoxWithTheSameHashBack)
{
    const std::int64_t id = writtenTextBox({ 20, 100 });
    const auto box = model().textBoxArray().last().textBox;
    platform::View *const button = box->deleteTextButton();
    box->deleteTextBox();
    settle();
    ASSERT_EQ(canvas->subviews(), std::vector<platform::View *> { button });
    ASSERT_TRUE(button->isHidden());
    static_cast<void>(recorder.take());

    controller->handleToolSelection(undo);
    settle();

    EXPECT_EQ(idsOf(model().textBoxArray()), Ids { id });
    EXPECT_EQ(model().textBoxArray().last().textBox, box);
    EXPECT_EQ(box->hash(), id);
    EXPECT_EQ(canvas->subviews(), (std::vector<platform::View *> { button, box.get() }));
    EXPECT_TRUE(button->isHidden());
    EXPECT_EQ(recorder.take(), (Posts { "enableRedo true", "redraw" }));
}

TEST_F(DrawViewControllerSubviewTest, deletionOfAnUnknownBoxOnlyRepaintsAndTakesTheFirstResponder)
{
    const std::int64_t kept = writtenTextBox({ 20, 100 });
    static_cast<void>(recorder.take());

    controller->shouldDeleteTheTextBox(-1);

    EXPECT_EQ(idsOf(model().textBoxArray()), Ids { kept });
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(history().undoStack().size(), 1);
    EXPECT_EQ(recorder.take(), Posts());
}

// Subview operations

TEST_F(DrawViewControllerSubviewTest, removalByIdentifierTakesThatTextBoxOnly)
{
    const std::int64_t first = placedTextBox({ 20, 60 });
    const std::int64_t second = placedTextBox({ 20, 100 });
    const std::int64_t third = placedTextBox({ 20, 160 });
    Ids buttons;
    for (const TextBoxEntry &entry : model().textBoxArray())
        buttons.push_back(entry.textBox->deleteTextButton()->hash());

    controller->handlDrawingCanvasSubviewOperation(
        { QString(), SubviewOperation::removeWithId(second).toVariant() });

    Ids left;
    for (const platform::View *const view : canvas->subviews())
        left.push_back(view->hash());
    EXPECT_EQ(left, (Ids { first, buttons[0], buttons[1], third, buttons[2] }));
    EXPECT_EQ(model().textBoxArray().size(), 3);
}

TEST_F(DrawViewControllerSubviewTest, removalByTheIdentifierOfABoxThatIsNoSubviewDoesNothing)
{
    const std::int64_t gone = placedTextBox({ 20, 60 });
    const auto box = model().textBoxArray().last().textBox;
    box->removeFromSuperview();
    addPlainView();
    const std::vector<platform::View *> before = canvas->subviews();

    postSubviewOperation(SubviewOperation::removeWithId(gone));

    EXPECT_EQ(canvas->subviews(), before);
}

TEST_F(DrawViewControllerSubviewTest, removalByIdentifierSparesAViewThatIsNoTextBox)
{
    const auto view = addPlainView();

    postSubviewOperation(SubviewOperation::removeWithId(view->hash()));

    EXPECT_EQ(canvas->subviews(), std::vector<platform::View *> { view.get() });
}

TEST_F(DrawViewControllerSubviewTest, firstLastAndAllTakeWhateverStandsThere)
{
    const auto bottom = addPlainView();
    placedTextBox({ 20, 60 });
    const auto top = addPlainView();
    TnTextBox *const box = model().textBoxArray().last().textBox.get();
    platform::View *const button = box->deleteTextButton();

    postSubviewOperation({ Case::removefirst, 0 });
    EXPECT_EQ(canvas->subviews(), (std::vector<platform::View *> { box, button, top.get() }));

    postSubviewOperation({ Case::removelast, 0 });
    EXPECT_EQ(canvas->subviews(), (std::vector<platform::View *> { box, button }));

    addPlainView();
    postSubviewOperation({ Case::removeall, 0 });
    EXPECT_TRUE(canvas->subviews().empty());
    EXPECT_EQ(model().textBoxArray().size(), 1);
}

TEST_F(DrawViewControllerSubviewTest, subviewOperationsOnACanvasWithoutSubviewsDoNothing)
{
    for (const Case operation :
        { Case::removeWithId, Case::removefirst, Case::removelast, Case::removeall })
        postSubviewOperation({ operation, 0 });

    EXPECT_TRUE(canvas->subviews().empty());
}

} // namespace
} // namespace penwick::test
