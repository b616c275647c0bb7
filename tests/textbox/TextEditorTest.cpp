// SPDX-License-Identifier: MIT
// The editor under a text box: what of the toolkit's editor it is, and what it paints itself.
#include "textbox/TextBoxFixture.h"

#include "textbox/TextKeys.h"

#include <QKeyEvent>
#include <QMenu>
#include <QPainter>
#include <QScrollBar>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextOption>
#include <QWheelEvent>

namespace penwick::test {
namespace {

class TextEditorTest : public TextBoxFixture
{
protected:
    /// Whether the caret is to be seen where the insertion point of an empty box is.
    [[nodiscard]] bool isCaretSeen(const TnTextBox &box) const
    {
        const QImage picture = pictureOf(box);
        const QRect caret = box.cursorRect();
        return picture.pixelColor(caret.left(), caret.top() + 3) == box.textFontColor();
    }

    /// How much of it is painted, in pixels that are darker than paper.
    [[nodiscard]] int inkOf(const TnTextBox &box) const
    {
        const QImage picture = pictureOf(box).copy(box.rect().adjusted(5, 5, -5, -5));
        int dark = 0;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x)
                dark += picture.pixelColor(x, y).lightness() < 128 ? 1 : 0;
        }
        return dark;
    }

    static bool isTaken(TnTextBox &box, QKeyCombination keys)
    {
        QKeyEvent event(QEvent::KeyPress, keys.key(), keys.keyboardModifiers());
        event.ignore();
        QCoreApplication::sendEvent(&box, &event);
        return event.isAccepted();
    }
};

TEST_F(TextEditorTest, isNothingButText)
{
    const auto box = newBox();

    EXPECT_EQ(box->frameShape(), QFrame::NoFrame);
    EXPECT_EQ(box->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    EXPECT_EQ(box->verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    EXPECT_FALSE(box->viewport()->autoFillBackground());
    EXPECT_FALSE(box->acceptRichText());
    EXPECT_EQ(box->wordWrapMode(), QTextOption::WrapAtWordBoundaryOrAnywhere);
    EXPECT_EQ(box->cursorWidth(), 0);
    EXPECT_EQ(box->accessibleName(), QStringLiteral("Text box"));
}

TEST_F(TextEditorTest, inkIsThatOfAllThatIsWrittenHereAndLater)
{
    const auto box = newBox();

    for (const int size : { 30, 18 }) {
        QFont font = box->font();
        font.setPixelSize(size);
        const QColor color(0, size, 200);
        box->setInk(font, color, { 7, 8 });

        EXPECT_EQ(box->font().pixelSize(), size);
        EXPECT_EQ(box->document()->defaultFont().pixelSize(), size);
        EXPECT_EQ(box->textColor(), color);
        EXPECT_EQ(box->document()->documentMargin(), 0.0);
        EXPECT_FALSE(box->document()->isUndoAvailable());
    }
}

TEST_F(TextEditorTest, showsACaretWhereAndWhileItIsWritten)
{
    const auto box = newBox();
    EXPECT_TRUE(isCaretSeen(*box));

    box->setEditable(false);
    settle();
    EXPECT_FALSE(isCaretSeen(*box));
    box->setEditable(true);
    settle();
    EXPECT_TRUE(isCaretSeen(*box));

    box->clearFocus();
    settle();
    EXPECT_FALSE(isCaretSeen(*box));
    box->setFocus();
    settle();
    EXPECT_TRUE(isCaretSeen(*box));
}

TEST_F(TextEditorTest, readOnlyOneThatGetsTheFocusShowsNoCaret)
{
    const auto box = newBox();
    box->clearFocus();
    box->setEditable(false);
    box->setFocus();
    settle();

    EXPECT_FALSE(isCaretSeen(*box));
}

TEST_F(TextEditorTest, keyThatMovesNothingShowsTheCaretAgain)
{
    QApplication::setCursorFlashTime(200);
    const auto box = newBox();
    ASSERT_TRUE(QTest::qWaitFor([&] { return !isCaretSeen(*box); })) << "it blinks";

    QApplication::setCursorFlashTime(0); // steady from now on, so that the test has time to look
    QTest::keyClick(box.get(), Qt::Key_Home);
    settle();

    EXPECT_TRUE(isCaretSeen(*box));
}

TEST_F(TextEditorTest, caretThatIsMovedIsShownAgain)
{
    QApplication::setCursorFlashTime(200);
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("mm"));
    settle();
    ASSERT_TRUE(isCaretSeen(*box));
    ASSERT_TRUE(QTest::qWaitFor([&] { return !isCaretSeen(*box); })) << "it blinks";

    QApplication::setCursorFlashTime(0);
    box->moveCursor(QTextCursor::Start);
    settle();

    EXPECT_TRUE(isCaretSeen(*box));
}

TEST_F(TextEditorTest, caretThatIsNotSeenWithoutTheFocusDoesNotBlinkEither)
{
    QApplication::setCursorFlashTime(20);
    const auto former = placedBox();
    const auto box = newBox({ 20, 60 });
    former->setEditable(true);
    former->setFocus();
    box->setFocus();
    settle();
    PaintRecorder withoutFocus(*former->viewport());
    PaintRecorder withFocus(*box->viewport());
    std::size_t blinks = 0;

    ASSERT_TRUE(QTest::qWaitFor([&] { return (blinks += withFocus.take().size()) > 4; }));

    EXPECT_EQ(withoutFocus.take().size(), 0U);
}

TEST_F(TextEditorTest, placedOneTakesNothingFromTheClipboard)
{
    const auto box = placedBox();

    paste(*box, QStringLiteral("more"));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TextEditorTest, wheelOverTextThatIsAllSeenIsNotItsOwn)
{
    const auto box = placedBox();
    const auto isTurnTaken = [&box](Qt::KeyboardModifiers modifiers) {
        QWheelEvent turn(QPointF(20, 15), box->mapToGlobal(QPointF(20, 15)), {}, { 0, -120 },
            Qt::NoButton, modifiers, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(box->viewport(), &turn);
        return turn.isAccepted();
    };
    EXPECT_FALSE(isTurnTaken({}));

    doubleClickOn(*box, { 50, 15 });
    paste(*box, QStringLiteral("\n").repeated(30));
    leave();
    ASSERT_GT(box->verticalScrollBar()->maximum(), 0);
    EXPECT_TRUE(isTurnTaken({}));
    EXPECT_GT(box->verticalScrollBar()->value(), 0);

    box->verticalScrollBar()->setValue(0);
    EXPECT_FALSE(isTurnTaken(Qt::ControlModifier));
    EXPECT_EQ(box->verticalScrollBar()->value(), 0);
}

TEST_F(TextEditorTest, caretIsSeenInTextThatIsScrolled)
{
    const auto box = newBox();

    paste(*box, QStringLiteral("\n").repeated(30));

    ASSERT_GT(box->verticalScrollBar()->value(), 0);
    EXPECT_TRUE(isCaretSeen(*box));
}

TEST_F(TextEditorTest, menuOfItClosesAsTheEditEnds)
{
    const auto box = placedBox();
    doubleClickOn(*box, { 50, 15 });
    QMenu menu(box.get());
    menu.addAction(QStringLiteral("Paste"));
    menu.popup(QPoint(10, 10));
    ASSERT_TRUE(menu.isVisible());

    box->setEditable(false);

    EXPECT_FALSE(menu.isVisible());
}

TEST_F(TextEditorTest, letterWithControlIsACommandWithShiftToo)
{
    const auto typed = [](Qt::KeyboardModifiers modifiers) {
        return typedBy(QKeyEvent(QEvent::KeyPress, Qt::Key_X, modifiers, QStringLiteral("X")));
    };

    EXPECT_EQ(typed(Qt::ShiftModifier), QStringLiteral("X"));
    EXPECT_EQ(typed(Qt::ControlModifier | Qt::AltModifier), QStringLiteral("X")) << "AltGr";
    EXPECT_EQ(typed(Qt::ControlModifier), QString());
    EXPECT_EQ(typed(Qt::ControlModifier | Qt::ShiftModifier), QString());
}

TEST_F(TextEditorTest, paintsWhatItIsScrolledTo)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("\n").repeated(30) + QStringLiteral("mmmm"));
    leave();
    QScrollBar &scroll = *box->verticalScrollBar();
    ASSERT_GT(scroll.maximum(), 0);
    scroll.setValue(0);
    settle();
    EXPECT_EQ(inkOf(*box), 0);

    scroll.setValue(scroll.maximum());
    settle();

    EXPECT_GT(inkOf(*box), 50);
}

TEST_F(TextEditorTest, marksWhatIsSelectedInEachLineOfIt)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("mm\nmm\nmm"));
    QTextCursor cursor = box->textCursor();
    cursor.setPosition(1);
    cursor.setPosition(7, QTextCursor::KeepAnchor);
    box->setTextCursor(cursor);
    settle();

    const QImage picture = pictureOf(*box);
    const QColor marked = box->palette().color(QPalette::Active, QPalette::Highlight);
    const auto isMarked = [&](int position) {
        QTextCursor there(box->document());
        there.setPosition(position);
        const QRect place = box->cursorRect(there);
        return picture.pixelColor(place.left() + 1, place.top() + 1) == marked;
    };
    std::string seen;
    for (const int position : { 0, 1, 3, 4, 6, 7 })
        seen += isMarked(position) ? 'x' : '.';
    EXPECT_EQ(seen, ".xxxx.");
}

// Line by line, because the toolkit is slow with many lines at once. The pixels are the same.
TEST_F(TextEditorTest, textWithASelectionLooksAsTheToolkitPaintsIt)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("The quick brown fox\n\njumps ").repeated(3));
    QTextCursor cursor = box->textCursor();
    cursor.setPosition(6);
    cursor.setPosition(40, QTextCursor::KeepAnchor);
    box->setTextCursor(cursor);
    settle();
    const QImage shown = pictureOf(*box).convertToFormat(QImage::Format_RGB32);

    QImage expected(box->size(), QImage::Format_RGB32);
    expected.fill(Qt::white);
    QAbstractTextDocumentLayout::PaintContext context;
    QTextCharFormat format;
    format.setBackground(box->palette().brush(QPalette::Active, QPalette::Highlight));
    format.setForeground(box->palette().brush(QPalette::Active, QPalette::HighlightedText));
    context.selections = { { cursor, format } };
    QPainter painter(&expected);
    painter.translate(0, -box->verticalScrollBar()->value());
    box->document()->documentLayout()->draw(&painter, context);
    painter.end();

    const QRect inside = box->rect().adjusted(4, 4, -4, -4); // without the dashes
    const QRect caret = box->cursorRect();
    int different = 0;
    for (int y = inside.top(); y <= inside.bottom(); ++y) {
        for (int x = inside.left(); x <= inside.right(); ++x) {
            different += !caret.adjusted(0, 0, 2, 0).contains(x, y)
                    && shown.pixel(x, y) != expected.pixel(x, y)
                ? 1
                : 0;
        }
    }
    EXPECT_EQ(different, 0);
}

TEST_F(TextEditorTest, keyThatEndsTheEditGoesNoFurther)
{
    for (const Qt::Key key : { Qt::Key_Return, Qt::Key_Tab, Qt::Key_Escape }) {
        const auto box = newBox();
        QTest::keyClicks(box.get(), QStringLiteral("a"));

        EXPECT_TRUE(isTaken(*box, key)) << key;

        EXPECT_FALSE(box->isEditable());
        EXPECT_EQ(box->toPlainText(), QStringLiteral("a"));
    }
}

TEST_F(TextEditorTest, controlAndYBringBackWhatWasTakenBack)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("ab"));
    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier);
    ASSERT_EQ(box->toPlainText(), QString());

    EXPECT_TRUE(isTaken(*box, Qt::ControlModifier | Qt::Key_Y));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("ab"));
}

TEST_F(TextEditorTest, nextEditTakesNothingOfTheLastOneBack)
{
    const auto box = placedBox();
    doubleClickOn(*box, { 50, 15 });
    ASSERT_TRUE(box->isEditable());

    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TextEditorTest, pointerThatOnlyMovesElsewhereLeavesTheSelection)
{
    const auto box = placedBox();
    box->selectAll();

    moveOver(*canvas, { 250, 20 });
    releaseOn(*canvas, { 250, 20 });

    EXPECT_TRUE(box->textCursor().hasSelection());
}

TEST_F(TextEditorTest, pressElsewhereLeavesTheSelectionWhileItIsWritten)
{
    const auto box = placedBox();
    box->selectAll();
    doubleClickOn(*box, { 50, 15 });
    box->selectAll();
    QWidget elsewhere;

    QTest::mousePress(&elsewhere, Qt::LeftButton);

    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->textCursor().hasSelection());
}

TEST_F(TextEditorTest, pressElsewhereIsHeardThereThoughItClearsTheSelection)
{
    const auto box = placedBox();
    box->selectAll();
    const PaintRecorder painted(*canvas);
    controller->handleToolSelection(QStringLiteral("brush"));

    clickOn(*canvas, { 250, 20 });

    EXPECT_FALSE(box->textCursor().hasSelection());
    EXPECT_EQ(model().pathArray().size(), 1);
}

} // namespace
} // namespace penwick::test
