// SPDX-License-Identifier: MIT
// Editing: keys that end it, the clipboard and the editor's own undo.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

#include <ostream>

namespace penwick::test {
namespace {

using TnTextBoxKeyTest = TextBoxFixture;

struct EndingKey
{
    const char *name;
    Qt::Key key;

    friend std::ostream &operator<<(std::ostream &stream, const EndingKey &ending)
    {
        return stream << ending.name;
    }
};

class TnTextBoxEndingKeyTest : public TextBoxFixture,
                               public ::testing::WithParamInterface<EndingKey>
{ };

TEST_P(TnTextBoxEndingKeyTest, endsEditingSoThatTheNextClickMakesABox)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    QTest::keyClick(box.get(), GetParam().key);

    EXPECT_FALSE(box->isEditable());
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));

    controller->handleToolSelection(QStringLiteral("text"));
    click({ 40, 40 });
    EXPECT_EQ(model().textBoxArray().size(), 2);
}

TEST_P(TnTextBoxEndingKeyTest, inAnEmptyBoxDeletesIt)
{
    const auto box = newBox();

    QTest::keyClick(box.get(), GetParam().key);

    EXPECT_EQ(box->superview(), nullptr);
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
}

TEST_P(TnTextBoxEndingKeyTest, onAPlacedBoxKeepsItPlaced)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });

    QTest::keyClick(box.get(), GetParam().key);

    EXPECT_EQ(box->superview(), canvas);
    EXPECT_FALSE(box->isEditable());
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

INSTANTIATE_TEST_SUITE_P(Keys, TnTextBoxEndingKeyTest,
    ::testing::Values(EndingKey { "Return", Qt::Key_Return }, EndingKey { "Enter", Qt::Key_Enter },
        EndingKey { "Tab", Qt::Key_Tab }, EndingKey { "Backtab", Qt::Key_Backtab },
        EndingKey { "Escape", Qt::Key_Escape }),
    [](const auto &key) { return std::string(key.param.name); });

TEST_F(TnTextBoxKeyTest, shiftReturnBeginsALineAndGoesOnEditing)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    QTest::keyClick(box.get(), Qt::Key_Return, Qt::ShiftModifier);
    QTest::keyClicks(box.get(), QStringLiteral("b"));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("a\nb"));
    EXPECT_TRUE(box->isEditable());
}

TEST_F(TnTextBoxKeyTest, undoAndRedoWhileEditingAreTheEditorsOwn)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));

    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(box->toPlainText(), QString());
    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier); // there is nothing more
    EXPECT_EQ(box->textColor(), box->textFontColor());
    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
    EXPECT_EQ(model().textBoxArray().size(), 1);
    EXPECT_EQ(history().undoStack().size(), 1);
}

TEST_F(TnTextBoxKeyTest, keyboardSelectsCutsCopiesAndPastes)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("ab"));

    QTest::keyClick(box.get(), Qt::Key_A, Qt::ControlModifier);
    QTest::keyClick(box.get(), Qt::Key_X, Qt::ControlModifier);
    EXPECT_EQ(box->toPlainText(), QString());
    QTest::keyClick(box.get(), Qt::Key_V, Qt::ControlModifier);
    QTest::keyClick(box.get(), Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("abab"));
    QTest::keyClick(box.get(), Qt::Key_Left, Qt::ShiftModifier);
    QTest::keyClick(box.get(), Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), QStringLiteral("b"));
}

TEST_F(TnTextBoxKeyTest, richTextIsPastedPlainInTheBoxesOwnFontAndColour)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    auto *const rich = new QMimeData;
    rich->setHtml(QStringLiteral("<b style='color:red;font-size:80px'>bold</b>"));
    rich->setText(QStringLiteral("bold"));
    QApplication::clipboard()->setMimeData(rich);

    box->paste();
    QTest::keyClicks(box.get(), QStringLiteral("c"));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("aboldc"));
    QTextCursor cursor(box->document());
    while (!cursor.atEnd()) {
        cursor.movePosition(QTextCursor::NextCharacter);
        EXPECT_EQ(cursor.charFormat().foreground().color(), box->textFontColor());
        EXPECT_EQ(cursor.charFormat().fontWeight(), static_cast<int>(QFont::Normal));
        EXPECT_FALSE(cursor.charFormat().hasProperty(QTextFormat::FontPixelSize));
    }
}

TEST_F(TnTextBoxKeyTest, imageIsNotPasted)
{
    const auto box = newBox();
    QImage picture(10, 10, QImage::Format_RGB32);
    picture.fill(Qt::red);
    QApplication::clipboard()->setImage(picture);

    box->paste();

    EXPECT_TRUE(box->document()->isEmpty());
}

TEST_F(TnTextBoxKeyTest, markedUpTextIsPastedAsItIsWritten)
{
    const auto box = newBox();
    auto *const markdown = new QMimeData;
    markdown->setData(QStringLiteral("text/markdown"), "**bold**");
    markdown->setText(QStringLiteral("**bold**"));
    QApplication::clipboard()->setMimeData(markdown);

    box->paste();

    EXPECT_EQ(box->toPlainText(), QStringLiteral("**bold**"));
    EXPECT_EQ(box->textColor(), box->textFontColor());
}

TEST_F(TnTextBoxKeyTest, offerWithoutAnyFormatIsNotPasted)
{
    const auto box = newBox();
    QApplication::clipboard()->setMimeData(new QMimeData);

    box->paste();

    EXPECT_TRUE(box->document()->isEmpty());
}

TEST_F(TnTextBoxKeyTest, textKeepsTheBoxesColourAfterAllOfItWasDeleted)
{
    canvas->setBrushColor(TnhColors::redColor);
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    QTest::keyClick(box.get(), Qt::Key_Backspace);

    QTest::keyClicks(box.get(), QStringLiteral("b"));

    EXPECT_EQ(box->textColor(), TnhColors::redColor);
}

TEST_F(TnTextBoxKeyTest, placedBoxTakesNoText)
{
    const auto box = placedBox();
    clickOn(*box, { 50, 15 });
    QApplication::clipboard()->setText(QStringLiteral("more"));

    QTest::keyClick(box.get(), Qt::Key_V, Qt::ControlModifier);
    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier);
    clickOn(*box, { 50, 15 }, Qt::MiddleButton);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxKeyTest, losingTheFocusToSomethingElseDoesNotEndEditing)
{
    const auto box = newBox();

    for (const Qt::FocusReason reason :
        { Qt::PopupFocusReason, Qt::ActiveWindowFocusReason, Qt::OtherFocusReason }) {
        QFocusEvent out(QEvent::FocusOut, reason);
        QCoreApplication::sendEvent(box.get(), &out);
    }

    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(box->superview(), canvas);
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
}

} // namespace
} // namespace penwick::test
