// SPDX-License-Identifier: MIT
// What the pointer selects in an editor, by one, two and three clicks and by a drag.
#include "textbox/TextBoxFixture.h"

#include <QAbstractEventDispatcher>

namespace penwick::test {
namespace {

class TextEditorPointerTest : public TextBoxFixture
{
protected:
    TextEditorPointerTest() { paste(*m_box, QStringLiteral("zero\none two")); }

    /// The middle of the letter at `position`.
    [[nodiscard]] QPointF placeOf(int position) const
    {
        QTextCursor there(m_box->document());
        there.setPosition(position);
        return m_box->cursorRect(there).center() + QPointF(3, 0);
    }

    [[nodiscard]] QString selected() const { return m_box->textCursor().selectedText(); }

    [[nodiscard]] qsizetype timersOfTheEditor() const
    {
        return QAbstractEventDispatcher::instance()->registeredTimers(m_box.get()).size();
    }

    const std::shared_ptr<TnTextBox> m_box = newBox({ 20, 150 });
};

TEST_F(TextEditorPointerTest, threeClicksSelectTheParagraph)
{
    clickOn(*m_box, placeOf(10));
    EXPECT_EQ(selected(), QString());

    doubleClickOn(*m_box, placeOf(10));
    EXPECT_EQ(selected(), QStringLiteral("two"));

    clickOn(*m_box, placeOf(10));
    EXPECT_EQ(selected(), QStringLiteral("one two"));
}

TEST_F(TextEditorPointerTest, dragSelectsUntilTheLeftButtonIsLetGo)
{
    pressOn(*m_box, placeOf(5));
    dragOn(*m_box, placeOf(7));
    EXPECT_EQ(selected(), QStringLiteral("on"));

    pressOn(*m_box, placeOf(7), QEvent::MouseButtonPress, Qt::RightButton);
    releaseOn(*m_box, placeOf(7), Qt::RightButton);
    dragOn(*m_box, placeOf(9));
    EXPECT_EQ(selected(), QStringLiteral("one "));

    releaseOn(*m_box, placeOf(9));
    moveOver(*m_box, placeOf(11));
    EXPECT_EQ(selected(), QStringLiteral("one "));
}

TEST_F(TextEditorPointerTest, scrollingByADragBeyondTheTextEndsWithTheDrag)
{
    paste(*m_box, QStringLiteral("\n").repeated(30));
    const auto before = timersOfTheEditor();
    pressOn(*m_box, { 20, 15 });
    dragOn(*m_box, { 20, m_box->height() + 60.0 });
    ASSERT_EQ(timersOfTheEditor(), before + 1);

    releaseOn(*m_box, { 20, m_box->height() + 60.0 });

    EXPECT_EQ(timersOfTheEditor(), before);
}

} // namespace
} // namespace penwick::test
