// SPDX-License-Identifier: MIT
// The two modes of a text box.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

namespace penwick::test {
namespace {

using TnTextBoxTest = TextBoxFixture;

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

    contentOf(window).makeFirstResponder(canvas);

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

    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
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
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
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

    EXPECT_EQ(contentOf(window).firstResponder(), placed.get());
    EXPECT_FALSE(edited->isEditable());
    EXPECT_TRUE(edited->deleteTextButton()->isHidden());
}

TEST_F(TnTextBoxTest, pressMakesItFirstResponder)
{
    const auto box = placedBox();

    pressOn(*box, { 50, 15 });

    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
}

TEST_F(TnTextBoxTest, itIsFirstResponderBeforeTheEditorHearsOfThePress)
{
    const auto box = placedBox();
    platform::View *responder = nullptr;
    const QObject context; // goes before what it writes to
    QObject::connect(box.get(), &QTextEdit::selectionChanged, &context,
        [&] { responder = contentOf(window).firstResponder(); });

    // With Shift the editor selects up to the press, and nothing before it does.
    QMouseEvent press(QEvent::MouseButtonPress, QPointF(7, 15),
        box->viewport()->mapToGlobal(QPointF(7, 15)), Qt::LeftButton, Qt::LeftButton,
        Qt::ShiftModifier);
    QCoreApplication::sendEvent(box->viewport(), &press);

    ASSERT_TRUE(box->textCursor().hasSelection());
    EXPECT_EQ(responder, box.get());
}

TEST_F(TnTextBoxTest, oneClickOnABoxThatIsNotEditableTakesItsDashedBorderAway)
{
    const auto box = newBox();
    box->setReadOnly(true); // without leaving it
    ASSERT_TRUE(box->hasDashedBorder());

    clickOn(*box, { 50, 15 });

    EXPECT_FALSE(box->hasDashedBorder());
    EXPECT_EQ(borderWidth(*box), 3.0);
}

TEST_F(TnTextBoxTest, releaseMakesItFirstResponder)
{
    const auto box = placedBox();
    pressOn(*box, { 50, 15 });
    contentOf(window).makeFirstResponder(canvas);

    releaseOn(*box, { 50, 15 });

    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
}

} // namespace
} // namespace penwick::test
