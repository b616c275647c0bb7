// SPDX-License-Identifier: MIT
// Where an input method is told that the caret is: beside it, it shows what may be meant.
#include "textbox/TextBoxFixture.h"

#include <QInputMethod>
#include <QInputMethodEvent>
#include <QMoveEvent>
#include <QScrollBar>

namespace penwick::test {
namespace {

class TextCaretPlaceTest : public TextBoxFixture
{
protected:
    /// What is told, in whole pixels of the window, y down.
    static QRect told() { return QGuiApplication::inputMethod()->cursorRectangle().toRect(); }

    /// Where the caret is painted.
    static QRect painted(const TnTextBox &box)
    {
        QRect caret = box.cursorRect();
        caret.setWidth(2);
        return caret.translated(box.mapTo(box.QWidget::window(), QPoint()));
    }

    static void compose(TnTextBox &box, const QString &text)
    {
        QInputMethodEvent event(text, {});
        QCoreApplication::sendEvent(&box, &event);
    }
};

TEST_F(TextCaretPlaceTest, isInTheBox)
{
    const auto box = newBox();

    EXPECT_EQ(told().topLeft(), QPoint(20 + 5, height - 130 + 6));
    EXPECT_EQ(told().width(), 2);
    EXPECT_EQ(told(), painted(*box));
    QTest::keyClicks(box.get(), QStringLiteral("mm"));
    EXPECT_GT(told().x(), 50);
    EXPECT_EQ(told(), painted(*box));
}

TEST_F(TextCaretPlaceTest, isToldBesideTheOtherEndOfASelectionAndTheText)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("one two"));
    QTest::keyClick(box.get(), Qt::Key_Home, Qt::ShiftModifier);
    const QInputMethod &method = *QGuiApplication::inputMethod();

    EXPECT_EQ(told(), painted(*box));
    EXPECT_GT(method.anchorRectangle().left(), told().left() + 50);
    EXPECT_EQ(method.anchorRectangle().top(), told().top());
    EXPECT_EQ(method.anchorRectangle().width(), 2.0);
    EXPECT_EQ(box->inputMethodQuery(Qt::ImSurroundingText), QVariant(QStringLiteral("one two")));
    EXPECT_EQ(box->inputMethodQuery(Qt::ImCursorPosition), QVariant(0));
    EXPECT_EQ(box->inputMethodQuery(Qt::ImAnchorPosition), QVariant(7));
}

TEST_F(TextCaretPlaceTest, isToldAgainWhenTheWindowHasMoved)
{
    const auto box = newBox();
    int changes = 0;
    const QObject context; // goes before what it counts in
    QObject::connect(QGuiApplication::inputMethod(), &QInputMethod::cursorRectangleChanged,
        &context, [&changes] { ++changes; });
    QMoveEvent move(window.pos(), window.pos() - QPoint(40, 20));

    QCoreApplication::sendEvent(&window, &move);
    EXPECT_EQ(changes, 1);

    QWidget other; // gets the keyboard
    other.show();
    other.activateWindow();
    ASSERT_TRUE(QTest::qWaitFor([this] { return !window.isActiveWindow(); }));
    changes = 0;
    QCoreApplication::sendEvent(&window, &move);
    EXPECT_EQ(changes, 0);
}

TEST_F(TextCaretPlaceTest, goesWithABoxThatMovesAwayFromAnEdgeAsItIsComposedIn)
{
    const auto box = newBox({ 250, 10 });
    int changes = 0;
    const QObject context; // goes before what it counts in
    QObject::connect(QGuiApplication::inputMethod(), &QInputMethod::cursorRectangleChanged,
        &context, [&changes] { ++changes; });

    compose(*box, QStringLiteral("ka"));

    EXPECT_EQ(box->frame().x, 79.0);
    EXPECT_EQ(told(), painted(*box));
    EXPECT_GT(changes, 0);
}

TEST_F(TextCaretPlaceTest, isThatOfABoxThatWasDraggedBefore)
{
    const auto box = placedBox();
    pressOn(*box, { 30, 10 });
    dragOn(*box, { 60, 40 });
    releaseOn(*box, { 30, 10 });

    doubleClickOn(*box, { 20, 15 });
    compose(*box, QStringLiteral("ka"));

    EXPECT_EQ(box->frame().x, 50.0);
    EXPECT_EQ(told(), painted(*box));
}

TEST_F(TextCaretPlaceTest, countsWhatTheTextIsScrolledBy)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("1\n2\n3\n4\n5\n6\n7\n8\n9"));
    ASSERT_GT(box->verticalScrollBar()->value(), 0);

    compose(*box, QStringLiteral("ka"));
    EXPECT_EQ(told(), painted(*box));
    EXPECT_LT(told().bottom(), height);

    const QRect before = told();
    box->verticalScrollBar()->setValue(box->verticalScrollBar()->value() - 20);
    EXPECT_EQ(told(), before.translated(0, 20));
}

} // namespace
} // namespace penwick::test
