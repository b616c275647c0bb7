// SPDX-License-Identifier: MIT
// What the pointer looks like over the board and beside it.
#include "desktop/support/BoardFixture.h"

namespace penwick::desktop {

namespace {

const QPoint brushHotSpot(0, 20);

class Cursor : public BoardTest
{
protected:
    // Waits until the pointer, over the board, looks as the brush does.
    CursorLook waitForBrush()
    {
        desktop().pointer().moveTo(onScreen({ 200, 200 }));
        require([this] { return desktop().pointer().look().hotSpot == brushHotSpot; },
            "the pointer to look like the brush");
        return desktop().pointer().look();
    }
};

} // namespace

TEST_F(Cursor, overTheBoardIsTheBrush)
{
    open();

    const CursorLook look = waitForBrush();

    EXPECT_FALSE(look.image.isNull());
}

TEST_F(Cursor, followsTheTool)
{
    open(HostProgram::Steered);
    const CursorLook brush = waitForBrush();

    host().selectTool(QStringLiteral("eraser"));
    EXPECT_TRUE(waitUntil([&] {
        const CursorLook look = desktop().pointer().look();
        return look.hotSpot == brushHotSpot && look.image != brush.image;
    }));
    host().selectTool(QStringLiteral("text"));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look().hotSpot == QPoint(10, 10); }));
    host().selectTool(QStringLiteral("brush"));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() == brush; }));
}

TEST_F(Cursor, isTheBrushAgainAsSoonAsADragComesBackToTheBoard)
{
    open(HostProgram::Steered);
    const CursorLook brush = waitForBrush();
    Pointer &pointer = desktop().pointer();
    pointer.press();
    pointer.glideTo(onScreen({ -60, 200 }));
    host().steer(QStringLiteral("arrow"));
    require([&] { return pointer.look() != brush; }, "the arrow");

    pointer.glideTo(onScreen({ 200, 240 }));

    EXPECT_TRUE(waitUntil([&] { return pointer.look() == brush; })) << "while the button is held";
    pointer.release();
    waitForLevel({ 198, 240 }, inkOnWhite);
    EXPECT_TRUE(waitUntil([&] { return pointer.look() == brush; }));
}

TEST_F(Cursor, staysTheBrushForADragThatLeavesTheBoardAndComesBack)
{
    open();
    const CursorLook brush = waitForBrush();
    Pointer &pointer = desktop().pointer();

    pointer.press();
    pointer.glideTo(onScreen({ -60, 200 }));
    EXPECT_EQ(pointer.look(), brush) << "beside the board, with the button held";
    pointer.glideTo(onScreen({ 200, 240 }));
    pointer.release();

    waitForLevel({ 198, 240 }, inkOnWhite);
    EXPECT_TRUE(waitUntil([&] { return pointer.look() == brush; }));
}

TEST_F(Cursor, isNotTheBrushAfterADragThatEndedBesideTheBoard)
{
    open();
    const CursorLook brush = waitForBrush();

    drag({ { 200, 200 }, { -60, 200 } });

    waitForLevel({ 12, 200 }, inkOnWhite); // left of the tool bar
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() != brush; }));
    desktop().pointer().glideTo(onScreen({ 300, 300 }));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() == brush; }));
}

} // namespace penwick::desktop
