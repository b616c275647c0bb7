// SPDX-License-Identifier: MIT
// Which cursor is shown over a canvas, and when a drag gives it back or takes it away.
#include "canvas/CanvasFixture.h"

#include "appearance/ToolCursors.h"

namespace penwick::test {
namespace {

using platform::Cursor;

using DrawingCanvasViewCursorTest = CanvasFixture;

TEST_F(DrawingCanvasViewCursorTest, toolsCursorIsOverTheWholeCanvas)
{
    const Cursor cursor = getCursorOfType(QStringLiteral("Eraser_Cursor"));
    canvas->setCursorType(cursor);

    canvas->refreshCursorRects();

    EXPECT_EQ(canvas->cursor().pixmap().toImage(), cursor.forScale(1.0).pixmap().toImage());
    EXPECT_EQ(canvas->cursor().hotSpot(), QPoint(0, 20));
}

TEST_F(DrawingCanvasViewCursorTest, dragInsideSetsTheToolsCursorAgain)
{
    Cursor::arrow().set(*canvas);
    press({ 50, 60 });

    drag({ -1, 60 });
    drag({ 50, -1 });
    drag({ 300, 60 });
    drag({ 50, 201 });
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());

    drag({ 0, 0 });
    EXPECT_EQ(Cursor::currentCursor(), canvas->cursorType());
}

TEST_F(DrawingCanvasViewCursorTest, releaseOutsideSetsTheArrowOnlyInPlaceOfTheToolsCursor)
{
    canvas->cursorType().set(*canvas);
    press({ 50, 60 });
    release({ 299, 199 });
    EXPECT_EQ(Cursor::currentCursor(), canvas->cursorType());

    press({ 50, 60 });
    release({ 300, 60 });
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());

    const Cursor other = getCursorOfType(QStringLiteral("Move_Cursor"));
    other.set(*canvas);
    press({ 50, 60 });
    release({ 300, 60 });
    EXPECT_EQ(Cursor::currentCursor(), other);
}

TEST_F(DrawingCanvasViewCursorTest, dragInTheTopRowOfPixelsIsInside)
{
    press({ 50, 60 });
    for (const Point place : { Point { 0, 200 }, Point { 299, 200 } }) {
        Cursor::arrow().set(*canvas);

        drag(place); // the pointer is over the first row of the canvas's pixels

        EXPECT_EQ(Cursor::currentCursor(), canvas->cursorType());
        EXPECT_EQ(canvas->lastPoint(), place);
    }

    Cursor::arrow().set(*canvas);
    drag({ -1, 200 });
    drag({ 300, 200 });
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());
}

TEST_F(DrawingCanvasViewCursorTest, strokeThatEndsInTheTopRowOfPixelsKeepsTheToolsCursor)
{
    canvas->cursorType().set(*canvas);
    press({ 50, 60 });
    drag({ 50, 200 });
    release({ 50, 200 });
    EXPECT_EQ(Cursor::currentCursor(), canvas->cursorType());

    press({ 50, 60 });
    release({ 50, 201 });
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());
}

} // namespace
} // namespace penwick::test
