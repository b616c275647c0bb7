// SPDX-License-Identifier: MIT
// What an editor leaves behind when it is hidden: nothing.
#include "textbox/TextBoxFixture.h"

#include <QMenu>

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
    const std::shared_ptr<TnTextBox> m_box = newBox();
    LeaveCounter m_counter { *m_box->viewport() };
};

TEST_F(EditorHidingTest, withoutADragNoneEnds)
{
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
