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

    void dragOverIt()
    {
        QDragEnterEvent enter({ 20, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
        QCoreApplication::sendEvent(m_box->viewport(), &enter);
        QDragMoveEvent move({ 21, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
        QCoreApplication::sendEvent(m_box->viewport(), &move);
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
    dragOverIt();

    m_box->hide();
    EXPECT_EQ(m_counter.leaves(), 1);

    m_box->show();
    m_box->hide();
    EXPECT_EQ(m_counter.leaves(), 1);
}

TEST_F(EditorHidingTest, dragThatLeftBeforeHasEnded)
{
    dragOverIt();
    QDragLeaveEvent leave;
    QCoreApplication::sendEvent(m_box->viewport(), &leave);
    ASSERT_EQ(m_counter.leaves(), 1);

    m_box->hide();

    EXPECT_EQ(m_counter.leaves(), 1);
}

TEST_F(EditorHidingTest, dragThatWasDroppedBeforeHasEnded)
{
    dragOverIt();
    QDropEvent drop({ 21, 15 }, Qt::CopyAction, &m_dragged, Qt::LeftButton, {});
    QCoreApplication::sendEvent(m_box->viewport(), &drop);
    ASSERT_EQ(m_box->toPlainText(), QStringLiteral("from elsewhere"));

    m_box->hide();

    EXPECT_EQ(m_counter.leaves(), 0);
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
