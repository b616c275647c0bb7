// SPDX-License-Identifier: MIT
// What an editor leaves behind when it is hidden: nothing.
#include "textbox/TextBoxFixture.h"

#include <QDragEnterEvent>
#include <QMenu>
#include <QMimeData>

namespace penwick::test {
namespace {

/// How often a drag has left a widget.
class LeaveCounter final : public QObject
{
public:
    explicit LeaveCounter(QWidget &widget) { widget.installEventFilter(this); }
    [[nodiscard]] int leaves() const { return m_leaves; }

    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        m_leaves += event->type() == QEvent::DragLeave ? 1 : 0;
        return false;
    }

private:
    int m_leaves = 0;
};

class EditorHidingTest : public TextBoxFixture
{
protected:
    EditorHidingTest() { m_dragged.setText(QStringLiteral("from elsewhere")); }

    void dragOver(TnTextBox &box)
    {
        QDragEnterEvent enter({ 20, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
        QCoreApplication::sendEvent(box.viewport(), &enter);
        QDragMoveEvent move({ 21, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
        QCoreApplication::sendEvent(box.viewport(), &move);
    }

    /// Another box that is written in beside this one, as a host's own views may be.
    std::shared_ptr<TnTextBox> newBoxBeside()
    {
        QTest::keyClicks(m_box.get(), QStringLiteral("a"));
        auto other = newBox({ 20, 60 });
        m_box->setEditable(true);
        return other;
    }

    QMimeData m_dragged;
    const std::shared_ptr<TnTextBox> m_box = newBox();
    LeaveCounter m_counter { *m_box->viewport() };
};

TEST_F(EditorHidingTest, withoutADragNoneEnds)
{
    m_box->hide();

    EXPECT_EQ(m_counter.leaves(), 0);
}

TEST_F(EditorHidingTest, dragOverItEndsOnce)
{
    dragOver(*m_box);

    m_box->hide();
    EXPECT_EQ(m_counter.leaves(), 1);

    m_box->show();
    m_box->hide();
    EXPECT_EQ(m_counter.leaves(), 1);
}

TEST_F(EditorHidingTest, dragThatLeftBeforeHasEnded)
{
    dragOver(*m_box);
    QDragLeaveEvent leave;
    QCoreApplication::sendEvent(m_box->viewport(), &leave);
    ASSERT_EQ(m_counter.leaves(), 1);

    m_box->hide();

    EXPECT_EQ(m_counter.leaves(), 1);
}

TEST_F(EditorHidingTest, dragThatWasDroppedBeforeHasEnded)
{
    dragOver(*m_box);
    QDropEvent drop({ 21, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
    QCoreApplication::sendEvent(m_box->viewport(), &drop);
    ASSERT_EQ(m_box->toPlainText(), QStringLiteral("from elsewhere"));

    m_box->hide();

    EXPECT_EQ(m_counter.leaves(), 0);
}

// A leave goes to whatever the drag is over, so a box that it has left must send none.
TEST_F(EditorHidingTest, dragThatIsOverSomethingElseByNowGoesOnThere)
{
    const auto other = newBoxBeside();
    const LeaveCounter ofTheOther(*other->viewport());
    for (const QEvent::Type end : { QEvent::DragLeave, QEvent::Drop }) {
        dragOver(*m_box);
        if (end == QEvent::DragLeave) {
            QDragLeaveEvent leave;
            QCoreApplication::sendEvent(m_box->viewport(), &leave);
        } else {
            QDropEvent drop({ 21, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
            QCoreApplication::sendEvent(m_box->viewport(), &drop);
        }
        dragOver(*other);

        m_box->hide();
        m_box->show();

        EXPECT_EQ(ofTheOther.leaves(), 0) << end;
    }
}

TEST_F(EditorHidingTest, boxThatNoDragWasOverEndsNoneElsewhere)
{
    const auto other = newBoxBeside();
    const LeaveCounter ofTheOther(*other->viewport());
    dragOver(*other);

    m_box->hide();

    EXPECT_EQ(ofTheOther.leaves(), 0);
}

TEST_F(EditorHidingTest, boxThatIsHiddenTwiceEndsOneDragAlone)
{
    const auto other = newBoxBeside();
    const LeaveCounter ofTheOther(*other->viewport());
    dragOver(*m_box);
    m_box->hide();
    m_box->show();
    dragOver(*other);

    m_box->hide();

    EXPECT_EQ(ofTheOther.leaves(), 0);
}

TEST_F(EditorHidingTest, menuThatIsOpenStaysOpenUnderADrag)
{
    QMenu menu(m_box.get());
    menu.addAction(QStringLiteral("Copy"));
    menu.popup(QPoint(10, 10));
    dragOver(*m_box);
    QDragLeaveEvent leave;
    QCoreApplication::sendEvent(m_box->viewport(), &leave);

    EXPECT_TRUE(menu.isVisible());
}

TEST_F(EditorHidingTest, menuOfItCloses)
{
    QMenu menu(m_box.get());
    menu.addAction(QStringLiteral("Copy"));
    menu.popup(QPoint(10, 10));
    ASSERT_TRUE(menu.isVisible());

    m_box->hide();

    EXPECT_FALSE(menu.isVisible());
}

} // namespace
} // namespace penwick::test
