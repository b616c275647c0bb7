// SPDX-License-Identifier: MIT
// Which cursor a view shows, and when it takes it anew.
#include "platform/ViewFixture.h"

#include <QPixmap>

#include <optional>

namespace penwick::platform {

namespace {

QIcon square(int side)
{
    QPixmap pixmap(side, side);
    pixmap.fill(Qt::red);
    return QIcon(pixmap);
}

/// A view with one cursor over its bounds.
class CursorView final : public RecordingView
{
public:
    using RecordingView::RecordingView;

    void setDeclared(const std::optional<Cursor> &cursor) { m_declared = cursor; }
    void resetCursorRects() override
    {
        if (m_declared)
            addCursorRect(bounds(), *m_declared);
    }

private:
    std::optional<Cursor> m_declared;
};

class ViewCursor : public ViewFixture
{
protected:
    ViewCursor()
    {
        m_view->setFrame({ 10.0, 10.0, 30.0, 30.0 });
        m_content.addSubview(m_view);
        Cursor::arrow().set(m_content);
    }

    static void enter(View &view)
    {
        QEnterEvent event(QPointF(1, 1), QPointF(1, 1), QPointF(1, 1));
        QCoreApplication::sendEvent(&view.widget(), &event);
    }

    const Cursor m_cursor { square(16), { 3.0, 4.0 } };
    const std::shared_ptr<CursorView> m_view = makeView<CursorView>();
};

using ViewCursorDeathTest = ViewCursor;

} // namespace

TEST_F(ViewCursor, pointerThatEntersSetsTheDeclaredCursor)
{
    m_view->setDeclared(m_cursor);
    m_view->refreshCursorRects();

    enter(*m_view);

    EXPECT_EQ(Cursor::currentCursor(), m_cursor);
    EXPECT_EQ(m_view->cursor().hotSpot(), QPoint(3, 4));
}

TEST_F(ViewCursor, invalidatedViewDeclaresItsCursorAtOnce)
{
    m_view->setDeclared(m_cursor);

    m_view->refreshCursorRects();

    EXPECT_TRUE(m_view->testAttribute(Qt::WA_SetCursor));
    EXPECT_EQ(m_view->cursor().hotSpot(), QPoint(3, 4));
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow()) << "the pointer is elsewhere";
}

TEST_F(ViewCursor, firstEntryAsksForTheCursor)
{
    m_view->setDeclared(m_cursor);

    enter(*m_view);

    EXPECT_EQ(m_view->cursor().hotSpot(), QPoint(3, 4));
}

TEST_F(ViewCursor, entryGivesBackTheDeclaredCursorAfterAnotherWasSet)
{
    const Cursor other(square(8), { 1.0, 2.0 });
    m_view->setDeclared(m_cursor);
    m_view->refreshCursorRects();
    other.set(*m_view);
    ASSERT_EQ(m_view->cursor().hotSpot(), QPoint(1, 2));

    enter(*m_view);

    EXPECT_EQ(Cursor::currentCursor(), m_cursor);
    EXPECT_EQ(m_view->cursor().hotSpot(), QPoint(3, 4));
}

TEST_F(ViewCursor, viewThatDeclaresNothingAnyMoreHasNoCursorOfItsOwn)
{
    m_view->setDeclared(m_cursor);
    m_view->refreshCursorRects();
    m_view->setDeclared(std::nullopt);

    m_view->refreshCursorRects();

    EXPECT_FALSE(m_view->testAttribute(Qt::WA_SetCursor));
}

TEST_F(ViewCursor, viewWithoutACursorLeavesTheCurrentOne)
{
    const auto plain = added({ 50.0, 50.0, 10.0, 10.0 });
    m_cursor.set(*m_view);

    enter(*plain);

    EXPECT_EQ(Cursor::currentCursor(), m_cursor);
}

TEST_F(ViewCursorDeathTest, cursorForAPartOfAViewStopsTheProcess)
{
    EXPECT_DEATH(m_view->addCursorRect({ 0.0, 0.0, 5.0, 5.0 }, m_cursor),
        "penwick: fatal error: a cursor rectangle covers its view's bounds");
}

} // namespace penwick::platform
