// SPDX-License-Identifier: MIT
// A placed box: moved, edited again and deleted.
#include "desktop/support/TextBoxFixture.h"

namespace penwick::desktop {

namespace {

using TextBoxPlaced = TextBoxTest;

constexpr QPoint place { 300, 200 };

} // namespace

TEST_F(TextBoxPlaced, doubleClickEditsItAgain)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");

    doubleClick(corner + QPoint(20, 20));

    EXPECT_TRUE(comesToBeEdited(corner));
    EXPECT_TRUE(deleteButtonComesToBe(corner, deleteMark));
    desktop().keyboard().press("End");
    type(corner, "mm");
}

TEST_F(TextBoxPlaced, dragMovesItAndThePixelUnderThePointerStaysUnderIt)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    const QPoint way(137, 91);
    const QImage before = pictureOf({ corner, newBoxSize });

    drag({ corner + QPoint(21, 12), corner + QPoint(21, 12) + way });

    EXPECT_TRUE(comesToBePlaced(corner + way));
    EXPECT_TRUE(vanishes(corner));
    EXPECT_EQ(difference(pictureOf({ corner + way, newBoxSize }), before), QRect());
}

TEST_F(TextBoxPlaced, clickKeepsItPlaced)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    const QImage before = pictureOf({ corner, newBoxSize });

    click(corner + QPoint(100, 15));
    desktop().keyboard().type("mmm");
    host().selectTool(QStringLiteral("brush"));
    settle();

    EXPECT_EQ(difference(pictureOf({ corner, newBoxSize }), before), QRect());
}

TEST_F(TextBoxPlaced, backspaceDeletesItAndUndoBringsItBack)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    const QImage before = pictureOf({ corner, newBoxSize });

    click(corner + QPoint(100, 15));
    desktop().keyboard().press("BackSpace");
    EXPECT_TRUE(vanishes(corner));

    host().selectTool(QStringLiteral("undo"));
    EXPECT_TRUE(comesToBePlaced(corner));
    EXPECT_TRUE(waitUntil([&] {
        return difference(pictureOf({ corner, newBoxSize }), before) == QRect();
    }));
}

TEST_F(TextBoxPlaced, deleteKeyDeletesIt)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");

    click(corner + QPoint(100, 15));
    desktop().keyboard().press("Delete");

    EXPECT_TRUE(vanishes(corner));
}

TEST_F(TextBoxPlaced, dragOutOfReachEndsWithTwentyPointsOnTheBoard)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    const QSize board = canvas().size();

    drag({ corner + QPoint(100, 15), { board.width() + 190, corner.y() + 15 } });

    const QPoint reached(board.width() - 20, corner.y());
    EXPECT_TRUE(comesToBePlaced(reached));
    EXPECT_TRUE(vanishes(corner));
}

TEST_F(TextBoxPlaced, deleteButtonsHoverImageComesAndGoesAndAClickDeletesTheBox)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    doubleClick(corner + QPoint(20, 20));
    ASSERT_TRUE(deleteButtonComesToBe(corner, deleteMark));

    desktop().pointer().glideTo(onScreen(deleteButtonOf(corner)));
    EXPECT_TRUE(deleteButtonComesToBe(corner, hoveredDeleteMark));
    desktop().pointer().glideTo(onScreen(deleteButtonOf(corner) + QPoint(40, 0)));
    EXPECT_TRUE(deleteButtonComesToBe(corner, deleteMark));

    click(deleteButtonOf(corner));
    EXPECT_TRUE(vanishes(corner));
    EXPECT_TRUE(deleteButtonComesToBe(corner, Qt::white));

    host().selectTool(QStringLiteral("undo"));
    EXPECT_TRUE(comesToBePlaced(corner));
    EXPECT_TRUE(deleteButtonComesToBe(corner, Qt::white));
}

TEST_F(TextBoxPlaced, pointerSaysWhetherABoxIsWrittenInOrMoved)
{
    openForText();
    const QPoint corner = placeBox(place, "Hi");
    const auto comesToHave = [this](QPoint hotSpot) {
        return waitUntil([&] { return desktop().pointer().look().hotSpot == hotSpot; });
    };

    desktop().pointer().glideTo(onScreen(corner + QPoint(20, 20)));
    EXPECT_TRUE(comesToHave({ 12, 12 }));
    doubleClick(corner + QPoint(20, 20));
    ASSERT_TRUE(comesToBeEdited(corner));
    desktop().pointer().glideTo(onScreen(corner + QPoint(40, 15)));
    EXPECT_TRUE(comesToHave({ 10, 10 }));
    const CursorLook text = desktop().pointer().look();
    desktop().pointer().glideTo(onScreen(deleteButtonOf(corner)));
    EXPECT_TRUE(waitUntil([&] { return desktop().pointer().look() != text; }));
}

} // namespace penwick::desktop
