// SPDX-License-Identifier: MIT
// The insertion point of an editor.
#include "textbox/TextCaret.h"

#include <QAbstractEventDispatcher>
#include <QApplication>
#include <QImage>
#include <QPainter>
#include <QTest>
#include <QTextEdit>

#include <gtest/gtest.h>

#include <functional>

namespace penwick::test {

namespace {

class PaintCounter final : public QObject
{
public:
    explicit PaintCounter(QWidget &widget) { widget.installEventFilter(this); }

    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        count += event->type() == QEvent::Paint ? 1 : 0;
        return false;
    }

    int count = 0;
};

/// An editor with "Hello" in it and a red caret before it; the caret does not blink.
class TextCaretTest : public testing::Test
{
protected:
    TextCaretTest()
        : m_caret(m_editor)
    {
        QApplication::setCursorFlashTime(0);
        m_editor.resize(100, 40);
        m_editor.setPlainText(QStringLiteral("Hello"));
        m_caret.setColor(Qt::red);
    }
    ~TextCaretTest() override { QApplication::setCursorFlashTime(m_flashTime); }

    /// The area in which the caret paints now, by the corners.
    [[nodiscard]] QRect painted() const
    {
        QImage picture(100, 40, QImage::Format_RGB32);
        picture.fill(Qt::white);
        QPainter painter(&picture);
        m_caret.paint(painter);
        painter.end();
        QRect area;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x) {
                if (picture.pixelColor(x, y) == QColor(Qt::red))
                    area |= QRect(x, y, 1, 1);
            }
        }
        return area;
    }

    /// Of the timers that run for it, in milliseconds.
    [[nodiscard]] QList<int> intervals()
    {
        QList<int> found;
        for (const auto &timer : QAbstractEventDispatcher::instance()->registeredTimers(&m_caret))
            found.append(timer.interval);
        return found;
    }

    QTextEdit m_editor;
    TextCaret m_caret;
    const int m_flashTime = QApplication::cursorFlashTime();
};

} // namespace

TEST_F(TextCaretTest, isNotThereBeforeItIsShown)
{
    EXPECT_EQ(painted(), QRect());
}

TEST_F(TextCaretTest, isTwoPointsWideAndAsHighAsTheLine)
{
    m_caret.show();

    const QRect cursor = m_editor.cursorRect();
    EXPECT_EQ(painted(), QRect(cursor.topLeft(), QSize(2, cursor.height())));
}

TEST_F(TextCaretTest, followsTheInsertionPoint)
{
    m_caret.show();

    m_editor.moveCursor(QTextCursor::End);

    EXPECT_EQ(painted().topLeft(), m_editor.cursorRect().topLeft());
}

TEST_F(TextCaretTest, isNotThereOnceItIsHidden)
{
    m_caret.show();
    m_caret.hide();
    m_caret.restart();

    EXPECT_EQ(painted(), QRect());
}

TEST_F(TextCaretTest, blinksAtTheDesktopsPaceAndIsSolidAgainAfterAKey)
{
    QApplication::setCursorFlashTime(20);
    m_caret.show();

    EXPECT_TRUE(QTest::qWaitFor([this] { return painted().isNull(); }));
    m_caret.restart();
    EXPECT_FALSE(painted().isNull());
    EXPECT_TRUE(QTest::qWaitFor([this] { return painted().isNull(); }));
    EXPECT_TRUE(QTest::qWaitFor([this] { return !painted().isNull(); }));
}

TEST_F(TextCaretTest, timeOnlyRunsWhileABlinkingOneIsShown)
{
    QApplication::setCursorFlashTime(1000);
    m_caret.restart();
    EXPECT_EQ(intervals(), QList<int> {}) << "it is not shown";

    m_caret.show();
    EXPECT_EQ(intervals(), QList<int> { 500 });

    m_caret.hide();
    EXPECT_EQ(intervals(), QList<int> {});
    m_caret.restart();
    EXPECT_EQ(intervals(), QList<int> {});
    m_caret.show();
    QApplication::setCursorFlashTime(0); // steady from now on
    m_caret.restart();
    EXPECT_EQ(intervals(), QList<int> {});
}

TEST_F(TextCaretTest, timeOfSomethingElseIsNotItsOwn)
{
    QApplication::setCursorFlashTime(1000);
    m_caret.show();
    QTimerEvent other(0);

    QCoreApplication::sendEvent(&m_caret, &other);

    EXPECT_FALSE(painted().isNull());
}

TEST_F(TextCaretTest, editorIsPaintedAgainForEachChange)
{
    m_editor.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&m_editor));
    PaintCounter paints(*m_editor.viewport());
    const auto isPaintedAfter = [&paints](const std::function<void()> &change) {
        QCoreApplication::processEvents();
        paints.count = 0;
        change();
        return QTest::qWaitFor([&paints] { return paints.count > 0; });
    };

    EXPECT_TRUE(isPaintedAfter([this] { m_caret.show(); }));
    EXPECT_TRUE(isPaintedAfter([this] { m_caret.restart(); }));
    EXPECT_TRUE(isPaintedAfter([this] { m_caret.hide(); }));
    m_editor.clearFocus(); // the toolkit paints for its own caret while it has the focus
    QApplication::setCursorFlashTime(20);
    m_caret.show();
    EXPECT_TRUE(isPaintedAfter([] {})) << "it blinks";
}

} // namespace penwick::test
