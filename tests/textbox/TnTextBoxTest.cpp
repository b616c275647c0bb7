// SPDX-License-Identifier: MIT
// The two modes of a text box, and its end.
#include "textbox/TextBoxFixture.h"

namespace penwick::test {
namespace {

using TnTextBoxTest = TextBoxFixture;

// As it is made

TEST_F(TnTextBoxTest, newBoxHasItsInitialValues)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    EXPECT_EQ(box->frame(), (Rect { 10, 20, 200, 30 }));
    EXPECT_EQ(box->mouseDownPoint(), (Point { 0, 0 }));
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(box->textFontSize(), 36.0);
    EXPECT_EQ(box->textFontColor(), TnhColors::redColor);
    EXPECT_EQ(box->textBoxDelegate(), nullptr);
    EXPECT_FALSE(box->isTextBoxDeleted());
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(box->textInteractionFlags(), Qt::TextEditorInteraction);
    EXPECT_TRUE(box->isUndoRedoEnabled());
    EXPECT_FALSE(box->document()->isUndoAvailable());
    EXPECT_EQ(box->textColor(), TnhColors::redColor);
    EXPECT_FALSE(box->viewport()->autoFillBackground());
    EXPECT_EQ(box->panGesture().state(), platform::PanGestureRecognizer::State::Possible);
}

TEST_F(TnTextBoxTest, placeholderIsTheHintInHalfTheColourInALabelFontJustified)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    const auto found
        = box->property("placeholderAttributedString").value<platform::AttributedString>();

    EXPECT_EQ(found, box->placeholderAttributedString());
    EXPECT_EQ(found.string, QStringLiteral("Type your text here.."));
    EXPECT_EQ(found.foregroundColor.rgb(), TnhColors::redColor.rgb());
    EXPECT_EQ(found.foregroundColor.alpha(), 128);
    EXPECT_EQ(found.font.pixelSize(), 14);
    EXPECT_EQ(found.alignment, Qt::AlignJustify);
}

TEST_F(TnTextBoxTest, newBoxHasAHiddenDeleteButtonOutsideItsTopRightCorner)
{
    const auto box = TnTextBox::create({ 100, 100, 200, 40 }, 24.0, TnhColors::redColor);

    ASSERT_NE(box->deleteTextButton(), nullptr);
    EXPECT_TRUE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->deleteTextButton()->superview(), nullptr);
    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { 301, 141, 20, 20 }));
}

TEST_F(TnTextBoxTest, textOfFontsUpTo24StandsSixPointsDownAndOfLargerOnesThree)
{
    const auto topAt = [](double size) {
        return TnTextBox::create({ 0, 0, 200, 30 }, size, Qt::black)->textContainerOrigin().y;
    };

    EXPECT_EQ(topAt(18.0), 6.0);
    EXPECT_EQ(topAt(24.0), 6.0);
    EXPECT_EQ(topAt(24.1), 3.0);
    EXPECT_EQ(topAt(30.0), 3.0);
    EXPECT_EQ(topAt(48.0), 3.0);
}

TEST_F(TnTextBoxTest, firstLineBeginsAtTheContainersOrigin)
{
    const auto small = newBox();
    canvas->setTextFontSize(30.0);
    const auto large = newBox({ 20, 60 });

    EXPECT_EQ(small->cursorRect().topLeft(), QPoint(5, 6));
    EXPECT_EQ(large->cursorRect().topLeft(), QPoint(5, 3));
}

TEST_F(TnTextBoxTest, fontIsTheSystemsWhereThePreferredOneIsNotInstalled)
{
    const auto box = TnTextBox::create({ 0, 0, 200, 30 }, 36.0, Qt::black);

    EXPECT_EQ(box->font().family(), QApplication::font().family());
    EXPECT_EQ(box->font().pixelSize(), 36);
}

TEST_F(TnTextBoxTest, newBoxOnACanvasIsEditedWithItsDeleteButtonBesideIt)
{
    const auto box = newBox();

    EXPECT_EQ(box->frame(), (Rect { 20, 100, 200, 30 }));
    EXPECT_EQ(window.firstResponder(), box.get());
    EXPECT_TRUE(box->hasFocus());
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(borderWidth(*box), 0.0);
    EXPECT_EQ(
        canvas->subviews(), (std::vector<platform::View *> { box.get(), box->deleteTextButton() }));
    EXPECT_FALSE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { 221, 131, 20, 20 }));
}

// Leaving

TEST_F(TnTextBoxTest, boxThatIsLeftWithTextIsPlaced)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    leave();

    EXPECT_FALSE(box->isEditable());
    EXPECT_FALSE(box->hasDashedBorder());
    EXPECT_FALSE(box->isTextBoxDeleted());
    EXPECT_EQ(borderWidth(*box), 3.0);
    EXPECT_EQ(box->layer()->borderColor, TnhColors::textBoxNormalBorderColor);
    EXPECT_EQ(box->layer()->cornerRadius, 1.0);
    EXPECT_TRUE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->superview(), canvas);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxTest, emptyBoxThatIsLeftRemovesItselfAndReportsItsHashOnce)
{
    RecordingOwner owner;
    const auto box = newBox();
    box->setTextBoxDelegate(&owner);

    window.makeFirstResponder(canvas);

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_TRUE(box->isTextBoxDeleted());
    EXPECT_FALSE(box->isEditable());
    EXPECT_TRUE(box->deleteTextButton()->isHidden());

    EXPECT_TRUE(box->resignFirstResponder());
    EXPECT_EQ(owner.reports, Ids { box->hash() });
}

TEST_F(TnTextBoxTest, boxWhoseTextWasDeletedAgainIsEmptyWhenItIsLeft)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    QTest::keyClick(box.get(), Qt::Key_Backspace);

    leave();

    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_TRUE(model().textBoxArray().isEmpty());
}

TEST_F(TnTextBoxTest, boxWithASpaceInItIsNotEmpty)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral(" "));

    leave();

    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(TnTextBoxTest, leavingDropsTheSelection)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    box->selectAll();

    leave();

    EXPECT_FALSE(box->textCursor().hasSelection());
}

// Clicks

TEST_F(TnTextBoxTest, clickOnAPlacedBoxSelectsItAndKeepsItPlaced)
{
    const auto box = placedBox();
    box->layer()->borderWidth = 0.0;

    clickOn(*box, { 50, 15 });

    EXPECT_EQ(window.firstResponder(), box.get());
    EXPECT_FALSE(box->isEditable());
    EXPECT_FALSE(box->hasDashedBorder());
    EXPECT_EQ(borderWidth(*box), 3.0);
    EXPECT_TRUE(box->deleteTextButton()->isHidden());
}

TEST_F(TnTextBoxTest, clickOnABoxThatIsEditedPutsTheInsertionPointThere)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    clickOn(*box, { 5, 15 });

    EXPECT_EQ(box->textCursor().position(), 0);
    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(borderWidth(*box), 0.0);
}

TEST_F(TnTextBoxTest, doubleClickOnAPlacedBoxEditsItAgain)
{
    const auto box = placedBox();

    doubleClickOn(*box, { 20, 15 });

    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(borderWidth(*box), 0.0);
    EXPECT_FALSE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(window.firstResponder(), box.get());
    QTest::keyClick(box.get(), Qt::Key_End);
    QTest::keyClicks(box.get(), QStringLiteral("!"));
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello!"));
}

TEST_F(TnTextBoxTest, doubleClickWhileEditingSelectsAWordAndGoesOnEditing)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    doubleClickOn(*box, { 20, 15 });

    EXPECT_EQ(box->textCursor().selectedText(), QStringLiteral("Hello"));
    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
}

TEST_F(TnTextBoxTest, clickOnAnotherBoxLeavesTheOneThatIsEdited)
{
    const auto placed = placedBox({ 20, 60 });
    const auto edited = newBox({ 20, 150 });
    QTest::keyClicks(edited.get(), QStringLiteral("a"));

    clickOn(*placed, { 20, 15 });

    EXPECT_EQ(window.firstResponder(), placed.get());
    EXPECT_FALSE(edited->isEditable());
    EXPECT_TRUE(edited->deleteTextButton()->isHidden());
}

TEST_F(TnTextBoxTest, releaseMakesItFirstResponder)
{
    const auto box = placedBox();
    pressOn(*box, { 50, 15 });
    window.makeFirstResponder(canvas);

    releaseOn(*box, { 50, 15 });

    EXPECT_EQ(window.firstResponder(), box.get());
}

// Its end

TEST_F(TnTextBoxTest, backspaceReleasedOverAPlacedBoxDeletesItOnce)
{
    RecordingOwner owner;
    const auto box = placedBox();
    box->setTextBoxDelegate(&owner);
    clickOn(*box, { 50, 15 });

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxTest, otherKeysOnAPlacedBoxDoNothing)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });

    for (const Qt::Key key : { Qt::Key_Delete, Qt::Key_A, Qt::Key_Space, Qt::Key_Left })
        QTest::keyClick(box.get(), key);

    EXPECT_EQ(box->superview(), canvas);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
    EXPECT_EQ(window.firstResponder(), box.get());
}

TEST_F(TnTextBoxTest, backspaceInABoxThatIsEditedDeletesACharacter)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hell"));
    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(TnTextBoxTest, backspaceInAnEmptyBoxThatIsEditedKeepsTheBox)
{
    const auto box = newBox();

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->superview(), canvas);
    EXPECT_TRUE(box->isEditable());
}

TEST_F(TnTextBoxTest, deleteButtonDeletesTheBoxThatIsEditedAndReportsOnce)
{
    RecordingOwner owner;
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    box->setTextBoxDelegate(&owner);

    clickOn(*box->deleteTextButton(), { 10, 10 });

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_FALSE(box->isTextBoxDeleted());
    EXPECT_TRUE(box->deleteTextButton()->isHidden());
}

TEST_F(TnTextBoxTest, deleteButtonOfAnEmptyBoxReportsOnce)
{
    RecordingOwner owner;
    const auto box = newBox();
    box->setTextBoxDelegate(&owner);

    clickOn(*box->deleteTextButton(), { 10, 10 });

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
}

TEST_F(TnTextBoxTest, boxIsOffItsCanvasWhenItReports)
{
    class Looking final : public QObject, public TextBoxDelegate
    {
    public:
        void shouldDeleteTheTextBox(std::int64_t) override { wasOnCanvas = box->superview(); }
        TnTextBox *box = nullptr;
        bool wasOnCanvas = true;
    } owner;
    const auto box = placedBox();
    owner.box = box.get();
    box->setTextBoxDelegate(&owner);

    box->deleteTextBox();

    EXPECT_FALSE(owner.wasOnCanvas);
}

TEST_F(TnTextBoxTest, delegateIsHeldWeakly)
{
    const auto box = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);
    {
        RecordingOwner owner;
        box->setTextBoxDelegate(&owner);
        EXPECT_EQ(box->textBoxDelegate(), &owner);
    }

    EXPECT_EQ(box->textBoxDelegate(), nullptr);
}

TEST_F(TnTextBoxTest, twoBoxesNeverShareAHash)
{
    const auto one = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);
    const auto other = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);

    EXPECT_NE(one->hash(), other->hash());
}

} // namespace
} // namespace penwick::test
