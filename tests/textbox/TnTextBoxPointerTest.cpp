// SPDX-License-Identifier: MIT
// Moving a placed box, the pointer's look over a box, and the buttons that are no pointer.
#include "textbox/TextBoxFixture.h"

#include "appearance/ToolCursors.h"
#include "platform/window/WindowContent.h"

#include <QMenu>
#include <QScrollBar>

namespace penwick::test {
namespace {

using State = platform::PanGestureRecognizer::State;
using TnTextBoxPointerTest = TextBoxFixture;

/// What the pointer looks like over `view`.
QImage lookOver(const platform::View &view)
{
    return view.surface().cursor().pixmap().toImage();
}

QImage lookOf(const QString &cursor)
{
    return getCursorOfType(cursor).forScale(1.0).pixmap().toImage();
}

// Moving

TEST_F(TnTextBoxPointerTest, dragOfAPlacedBoxKeepsThePointUnderThePointer)
{
    const auto box = placedBox();
    const Rect before = box->frame();

    pressOn(*box, { 30, 10 });
    dragOn(*box, { 45, 30 }); // 15 to the right, 20 down
    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 15, -20 }));
    EXPECT_EQ(box->mouseDownPoint(), (Point { 30, before.height - 10 }));
    EXPECT_EQ(box->panGesture().state(), State::Changed);

    dragOn(*box, { 29, 10 }); // the box has moved: one to the left of the grabbed point
    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 14, -20 }));

    releaseOn(*box, { 30, 10 });
    EXPECT_EQ(box->frame(), (Rect { 34, before.y - 20, before.width, before.height }));
    EXPECT_EQ(box->panGesture().state(), State::Ended);
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
    EXPECT_FALSE(box->isEditable());
}

TEST_F(TnTextBoxPointerTest, releaseMovesTheBoxToo)
{
    const auto box = placedBox();
    const Rect before = box->frame();
    pressOn(*box, { 30, 10 });
    dragOn(*box, { 40, 10 });

    releaseOn(*box, { 45, 16 }); // 15 to the right and 6 down of where the box is by now

    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 25, -6 }));
}

TEST_F(TnTextBoxPointerTest, grabIsInTheCoordinatesOfTheWindowsContentView)
{
    const auto box = placedBox();
    canvas->setFrame({ 10, 5, width, height });
    const Rect before = box->frame();

    pressOn(*box, { 30, 10 });
    dragOn(*box, { 45, 30 });
    releaseOn(*box, { 30, 10 });

    EXPECT_EQ(box->mouseDownPoint(), (Point { 30, before.height - 10 }));
    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 15, -20 }));
}

TEST_F(TnTextBoxPointerTest, clickOnAPlacedBoxAddsTheGesture)
{
    const auto box = placedBox();
    const Rect before = box->frame();
    box->removeGestureRecognizer(box->panGesture());

    pressOn(*box, { 30, 10 });
    dragOn(*box, { 45, 10 });

    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 15, 0 }));
}

TEST_F(TnTextBoxPointerTest, leavingABoxAddsTheGesture)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    const Rect before = box->frame();
    pressOn(*box, { 30, 10 }); // into what is edited: this adds none

    leave();
    box->panGesture().pressed(before.origin());
    dragOn(*box, { 45, 10 });

    EXPECT_EQ(box->panGesture().state(), State::Changed);
}

TEST_F(TnTextBoxPointerTest, secondDragStartsWhereTheFirstEnded)
{
    const auto box = placedBox();
    const Rect before = box->frame();
    pressOn(*box, { 30, 10 });
    dragOn(*box, { 40, 10 });
    releaseOn(*box, { 30, 10 });

    pressOn(*box, { 100, 20 });
    dragOn(*box, { 100, 10 });
    releaseOn(*box, { 100, 20 });

    EXPECT_EQ(box->frame().origin(), before.origin() + (Point { 10, 10 }));
}

TEST_F(TnTextBoxPointerTest, handThatTremblesOnAPlacedBoxDoesNotMoveIt)
{
    const auto box = placedBox();
    const Rect before = box->frame();

    pressOn(*box, { 30, 10 });
    dragOn(*box, { 32, 11 });
    releaseOn(*box, { 32, 11 });

    EXPECT_EQ(box->frame(), before);
}

TEST_F(TnTextBoxPointerTest, dragInABoxThatIsEditedSelectsTextAndMovesNothing)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    const Rect before = box->frame();

    pressOn(*box, { 5, 15 });
    dragOn(*box, { 150, 15 });
    releaseOn(*box, { 150, 15 });

    EXPECT_EQ(box->frame(), before);
    EXPECT_EQ(box->textCursor().selectedText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxPointerTest, pressInSelectedTextSelectsAnewAndDragsNoText)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello hello hello"));
    box->selectAll();

    // A drag of text would wait here until it is dropped, and select nothing.
    pressOn(*box, { 20, 15 });
    dragOn(*box, { 60, 15 });
    releaseOn(*box, { 60, 15 });

    EXPECT_TRUE(box->textCursor().hasSelection());
    EXPECT_LT(box->textCursor().selectedText().size(), 10);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello hello hello"));
}

TEST_F(TnTextBoxPointerTest, boxThatIsEditedAgainIsNotDragged)
{
    const auto box = placedBox();
    doubleClickOn(*box, { 20, 15 });
    const Rect before = box->frame();

    pressOn(*box, { 20, 15 });
    dragOn(*box, { 60, 15 });
    releaseOn(*box, { 60, 15 });

    EXPECT_EQ(box->frame(), before);
    EXPECT_EQ(box->panGesture().state(), State::Possible);
}

TEST_F(TnTextBoxPointerTest, dragOfAPlacedBoxSelectsNoText)
{
    const auto box = placedBox();

    pressOn(*box, { 5, 15 });
    dragOn(*box, { 100, 15 });
    releaseOn(*box, { 5, 15 });

    EXPECT_FALSE(box->textCursor().hasSelection());
}

TEST_F(TnTextBoxPointerTest, deleteButtonOfABoxThatWasMovedIsBesideItsNewPlace)
{
    const auto box = placedBox();
    pressOn(*box, { 30, 10 });
    dragOn(*box, { 40, 10 });
    releaseOn(*box, { 30, 10 });

    doubleClickOn(*box, { 20, 15 });

    EXPECT_EQ(box->deleteTextButton()->frame(),
        (Rect { box->frame().maxX() + 1, box->frame().maxY() + 1, 20, 20 }));
}

// Its look

TEST_F(TnTextBoxPointerTest, pointerIsTheTextCursorOverABoxThatIsEdited)
{
    const auto box = newBox();

    moveOver(*box, { 30, 10 });

    EXPECT_EQ(lookOver(*box), lookOf(QStringLiteral("Text_Cursor")));
}

TEST_F(TnTextBoxPointerTest, pointerIsTheMoveCursorOverAPlacedBox)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    moveOver(*box, { 30, 10 });
    leave();

    moveOver(*box, { 31, 10 });

    EXPECT_EQ(lookOver(*box), lookOf(QStringLiteral("Move_Cursor")));
    EXPECT_NE(lookOver(*box), lookOf(QStringLiteral("Text_Cursor")));
}

TEST_F(TnTextBoxPointerTest, pointerIsTheTextCursorAgainAfterADoubleClick)
{
    const auto box = placedBox();
    moveOver(*box, { 30, 10 });
    doubleClickOn(*box, { 20, 15 });

    moveOver(*box, { 31, 10 });

    EXPECT_EQ(lookOver(*box), lookOf(QStringLiteral("Text_Cursor")));
}

TEST_F(TnTextBoxPointerTest, cursorIsNotSetAgainWhileThePointerMoves)
{
    class Counter final : public QObject
    {
    public:
        bool eventFilter(QObject *, QEvent *event) override
        {
            count += event->type() == QEvent::CursorChange;
            return false;
        }
        int count = 0;
    } changes;
    const auto box = placedBox();
    box->viewport()->installEventFilter(&changes);

    for (int x = 20; x < 60; ++x)
        moveOver(*box, QPointF(x, 10));

    EXPECT_EQ(changes.count, 1);
}

// What is selected in a placed box

TEST_F(TnTextBoxPointerTest, selectionInAPlacedBoxIsGoneOnceSomethingElseIsPressed)
{
    const auto box = placedBox();
    const auto other = placedBox({ 20, 60 });
    const QImage before = pictureOf(*box);
    const std::vector<std::pair<const char *, platform::View *>> places { { "canvas", canvas },
        { "box", other.get() } };
    for (const auto &[name, view] : places) {
        for (const Qt::MouseButton button : { Qt::LeftButton, Qt::RightButton }) {
            box->selectAll();
            ASSERT_TRUE(box->textCursor().hasSelection());

            pressOn(*view, { 250, 10 }, QEvent::MouseButtonPress, button);
            releaseOn(*view, { 250, 10 }, button);
            settle();

            EXPECT_FALSE(box->textCursor().hasSelection()) << name << button;
            EXPECT_EQ(pictureOf(*box), before) << name << button;
        }
    }
}

TEST_F(TnTextBoxPointerTest, selectionInAPlacedBoxIsGoneOnceAnotherWindowIsPressed)
{
    const auto box = placedBox();
    platform::Window panel;
    box->selectAll();

    QTest::mouseClick(&panel, Qt::LeftButton);

    EXPECT_FALSE(box->textCursor().hasSelection());
}

TEST_F(TnTextBoxPointerTest, selectionInAPlacedBoxIsGoneOnceAPenPressesElsewhere)
{
    const auto box = placedBox();
    box->selectAll();
    QTabletEvent press(QEvent::TabletPress, QPointingDevice::primaryPointingDevice(),
        QPointF(250, 10), QPointF(250, 10), 1.0, 0, 0, 0.0, 0.0, 0.0, Qt::NoModifier,
        Qt::LeftButton, Qt::LeftButton);

    QCoreApplication::sendEvent(&canvas->widget(), &press);

    EXPECT_FALSE(box->textCursor().hasSelection());
}

TEST_F(TnTextBoxPointerTest, selectionInAPlacedBoxStaysForItsOwnMenu)
{
    const auto box = placedBox();
    box->selectAll();
    const std::unique_ptr<QMenu> menu(box->createStandardContextMenu());

    clickOn(*box, { 50, 15 }, Qt::RightButton);
    QMouseEvent press(QEvent::MouseButtonPress, QPointF(1, 1), QPointF(1, 1), Qt::LeftButton,
        Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(menu.get(), &press);

    EXPECT_EQ(box->textCursor().selectedText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxPointerTest, clearingASelectionScrollsNothing)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("1\n2\n3\n4\n5\n6\n7\n8\n9"));
    leave();
    box->selectAll();

    press({ 280, 190 });

    EXPECT_FALSE(box->textCursor().hasSelection());
    EXPECT_EQ(box->verticalScrollBar()->value(), 0);
}

TEST_F(TnTextBoxPointerTest, selectionInABoxThatIsEditedStaysWhateverIsPressedThatDoesNotEndTheEdit)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    box->selectAll();
    platform::Window panel;

    QTest::mouseClick(&panel, Qt::LeftButton);

    EXPECT_EQ(box->textCursor().selectedText(), QStringLiteral("Hello"));
}

// Other buttons

TEST_F(TnTextBoxPointerTest, otherButtonsOnAPlacedBoxDoNothing)
{
    const auto box = placedBox();
    const Rect before = box->frame();

    for (const Qt::MouseButton button : { Qt::RightButton, Qt::MiddleButton }) {
        clickOn(*box, { 30, 10 }, button);
        pressOn(*box, { 30, 10 }, QEvent::MouseButtonDblClick, button);
    }

    EXPECT_FALSE(box->isEditable());
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(box->frame(), before);
    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
}

TEST_F(TnTextBoxPointerTest, otherButtonsInABoxThatIsEditedDrawNothingAndGoOnEditing)
{
    const auto box = newBox();
    controller->handleToolSelection(QStringLiteral("brush"));

    for (const Qt::MouseButton button : { Qt::RightButton, Qt::MiddleButton })
        clickOn(*box, { 30, 10 }, button);

    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
    EXPECT_TRUE(box->isEditable());
}

TEST_F(TnTextBoxPointerTest, clickOnABoxWithTheBrushDrawsNothing)
{
    const auto box = placedBox();
    controller->handleToolSelection(QStringLiteral("brush"));

    pressOn(*box, { 30, 10 });
    dragOn(*box, { 60, 10 });
    releaseOn(*box, { 30, 10 });

    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(TnTextBoxPointerTest, wheelLeavesTheFontAsItIs)
{
    const auto box = placedBox();
    QWheelEvent turn({ 30, 10 }, box->viewport()->mapToGlobal(QPointF(30, 10)), {}, { 0, 120 },
        Qt::NoButton, Qt::ControlModifier, Qt::NoScrollPhase, false);

    QCoreApplication::sendEvent(box->viewport(), &turn);

    EXPECT_EQ(box->font().pixelSize(), 24);
}

} // namespace
} // namespace penwick::test
