// SPDX-License-Identifier: MIT
// How a text box is deleted.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

#include <algorithm>

namespace penwick::test {
namespace {

using TnTextBoxEndTest = TextBoxFixture;

TEST_F(TnTextBoxEndTest, backspaceReleasedOverAPlacedBoxDeletesItOnce)
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

TEST_F(TnTextBoxEndTest, deleteKeyDeletesAPlacedBoxAsBackspaceDoes)
{
    RecordingOwner owner;
    const auto box = placedBox();
    box->setTextBoxDelegate(&owner);
    clickOn(*box, { 50, 15 });

    QTest::keyClick(box.get(), Qt::Key_Delete);

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
}

TEST_F(TnTextBoxEndTest, backspaceAndDeleteWithModifiersKeepAPlacedBox)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });

    for (const Qt::Key key : { Qt::Key_Backspace, Qt::Key_Delete }) {
        for (const auto modifier : { Qt::ControlModifier, Qt::ShiftModifier, Qt::AltModifier }) {
            QTest::keyPress(box.get(), key, modifier);
            QTest::keyRelease(box.get(), key); // the modifier is let go first
        }
    }

    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(TnTextBoxEndTest, otherKeysOnAPlacedBoxDoNothing)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });

    for (const Qt::Key key : { Qt::Key_A, Qt::Key_Space, Qt::Key_Left })
        QTest::keyClick(box.get(), key);

    EXPECT_EQ(box->superview(), canvas);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
}

TEST_F(TnTextBoxEndTest, backspaceInABoxThatIsEditedDeletesACharacter)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hell"));
    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(TnTextBoxEndTest, backspaceInAnEmptyBoxThatIsEditedKeepsTheBox)
{
    const auto box = newBox();

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->superview(), canvas);
    EXPECT_TRUE(box->isEditable());
}

TEST_F(TnTextBoxEndTest, deleteButtonDeletesTheBoxThatIsEditedAndReportsOnce)
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

TEST_F(TnTextBoxEndTest, deleteButtonLiesAboveEveryOtherBoxAndKeepsItsPlaceAmongTheSubviews)
{
    const auto box = newBox({ 20, 84 });
    const auto covering = TnTextBox::create({ 200, 80, 90, 40 }, 24.0, TnhColors::redColor);
    const auto views = canvas->subviews();
    canvas->addSubview(covering);
    settle();

    const QPoint middle = box->deleteTextButton()->geometry().center();
    EXPECT_EQ(canvas->childAt(middle), box->deleteTextButton());
    ASSERT_TRUE(covering->geometry().contains(middle));
    const auto after = canvas->subviews();
    ASSERT_GT(after.size(), views.size());
    EXPECT_TRUE(std::equal(views.begin(), views.end(), after.begin()));
    EXPECT_EQ(after.at(views.size()), covering.get());
}

TEST_F(TnTextBoxEndTest, deleteButtonOfAnEmptyBoxReportsOnce)
{
    RecordingOwner owner;
    const auto box = newBox();
    box->setTextBoxDelegate(&owner);

    clickOn(*box->deleteTextButton(), { 10, 10 });

    EXPECT_EQ(owner.reports, Ids { box->hash() });
    EXPECT_EQ(box->superview(), nullptr);
}

TEST_F(TnTextBoxEndTest, boxIsOffItsCanvasWhenItReports)
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

TEST_F(TnTextBoxEndTest, delegateIsHeldWeakly)
{
    const auto box = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);
    {
        RecordingOwner owner;
        box->setTextBoxDelegate(&owner);
        EXPECT_EQ(box->textBoxDelegate(), &owner);
    }

    EXPECT_EQ(box->textBoxDelegate(), nullptr);
}

TEST_F(TnTextBoxEndTest, twoBoxesNeverShareAHash)
{
    const auto one = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);
    const auto other = TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black);

    EXPECT_NE(one->hash(), other->hash());
}

} // namespace
} // namespace penwick::test
