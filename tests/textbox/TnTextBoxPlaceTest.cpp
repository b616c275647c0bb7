// SPDX-License-Identifier: MIT
// What is typed is always seen: a box at each edge of its canvas.
#include "textbox/TextBoxFixture.h"

#include <QInputMethodEvent>
#include <QScrollBar>

namespace penwick::test {
namespace {

class TnTextBoxPlaceTest : public TextBoxFixture
{
protected:
    static bool isWhole(const Rect &frame, int canvasWidth = width, int canvasHeight = height)
    {
        return frame.x >= 0 && frame.y >= 0 && frame.maxX() <= canvasWidth
            && frame.maxY() <= canvasHeight;
    }

    /// Turns the wheel over the box by one notch, downwards; answers whether it took that.
    static bool turnWheel(TnTextBox &box, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QWheelEvent turn({ 30, 10 }, box.viewport()->mapToGlobal(QPointF(30, 10)), {}, { 0, -120 },
            Qt::NoButton, modifiers, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(box.viewport(), &turn);
        return turn.isAccepted();
    }

    static void drag(TnTextBox &box, QPointF way)
    {
        const QPointF grabbed(30, 10);
        pressOn(box, grabbed);
        dragOn(box, grabbed + way);
        releaseOn(box, grabbed);
    }

    const QString m_lines = QStringLiteral("1\n2\n3\n4\n5\n6\n7\n8\n9");
};

TEST_F(TnTextBoxPlaceTest, boxAtAnEdgeKeepsItsFrameUntilTheFirstLetter)
{
    const auto box = newBox({ 250, 10 });

    EXPECT_EQ(box->frame(), (Rect { 250, -14, 200, 30 }));
    QInputMethodEvent nothing; // as input methods send when they are asked to begin anew
    QCoreApplication::sendEvent(box.get(), &nothing);
    settle();
    EXPECT_EQ(box->frame(), (Rect { 250, -14, 200, 30 }));

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    settle();
    const Rect frame = box->frame();
    EXPECT_EQ(frame.x, 79.0);
    EXPECT_EQ(frame.y, 0.0);
    EXPECT_TRUE(isWhole(frame));
    EXPECT_EQ(
        box->deleteTextButton()->frame(), (Rect { frame.maxX() + 1, frame.maxY() + 1, 20, 20 }));
    EXPECT_TRUE(isWhole(box->deleteTextButton()->frame()));
}

TEST_F(TnTextBoxPlaceTest, boxAtTheTopMovesDownForItsDeleteButton)
{
    const auto box = newBox({ 20, 198 });

    QTest::keyClicks(box.get(), QStringLiteral("a"));

    EXPECT_EQ(box->frame().maxY(), 179.0);
    EXPECT_EQ(box->frame().x, 20.0);
}

TEST_F(TnTextBoxPlaceTest, firstLetterOfACompositionMovesTheBox)
{
    const auto box = newBox({ 250, 10 });

    QInputMethodEvent half(QStringLiteral("k"), {});
    QCoreApplication::sendEvent(box.get(), &half);

    EXPECT_TRUE(isWhole(box->frame()));
}

TEST_F(TnTextBoxPlaceTest, boxWhoseTextIsDeletedAgainStaysWhereItMoved)
{
    const auto box = newBox({ 250, 10 });
    QTest::keyClicks(box.get(), QStringLiteral("a"));

    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->frame().x, 79.0);
    EXPECT_TRUE(isWhole(box->frame()));
}

TEST_F(TnTextBoxPlaceTest, caretIsSeenAfterEveryKeyHoweverLargeTheTextBecomes)
{
    const auto box = newBox({ 250, 10 });

    for (int key = 0; key < 160; ++key) {
        QTest::keyClicks(box.get(), QStringLiteral("m"));
        ASSERT_TRUE(isWhole(box->frame())) << key;
        ASSERT_TRUE(box->viewport()->rect().contains(box->cursorRect())) << key;
    }

    EXPECT_EQ(box->frame(), (Rect { 0, 0, 300, 200 }));
}

TEST_F(TnTextBoxPlaceTest, placedBoxThatIsTooHighShowsItsBeginningAndTheWheelTheRest)
{
    const auto box = newBox();
    paste(*box, m_lines);
    ASSERT_EQ(box->frame().height, 200.0);
    ASSERT_GT(box->verticalScrollBar()->value(), 0);

    leave();
    EXPECT_EQ(box->verticalScrollBar()->value(), 0);

    EXPECT_TRUE(turnWheel(*box));
    EXPECT_GT(box->verticalScrollBar()->value(), 0);
    EXPECT_EQ(box->font().pixelSize(), 24);
}

TEST_F(TnTextBoxPlaceTest, wheelOverABoxThatIsShownWholeIsNotTaken)
{
    const auto box = placedBox();

    EXPECT_FALSE(turnWheel(*box));
}

TEST_F(TnTextBoxPlaceTest, wheelWithControlScrollsNothingAndKeepsTheFont)
{
    const auto box = newBox();
    paste(*box, m_lines);
    leave();

    EXPECT_FALSE(turnWheel(*box, Qt::ControlModifier));

    EXPECT_EQ(box->verticalScrollBar()->value(), 0);
    EXPECT_EQ(box->font().pixelSize(), 24);
}

TEST_F(TnTextBoxPlaceTest, caretOfANewBoxWithALargeFontIsNoTallerThanTheBox)
{
    canvas->setTextFontSize(48.0);
    const auto box = newBox();
    ASSERT_GT(box->cursorRect().bottom(), 30);

    const QImage picture = pictureOf(*box);

    EXPECT_EQ(qRed(picture.pixel(5, 3)), textGrey);
    EXPECT_EQ(qRed(picture.pixel(5, 26)), textGrey);
    EXPECT_EQ(qRed(picture.pixel(5, 27)), paper);
}

// The canvas

TEST_F(TnTextBoxPlaceTest, windowThatShrinksBringsTheBoxThatIsEditedAlong)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("The quick brown fox"));
    const double wide = box->frame().width;
    ASSERT_GT(wide, 230.0);

    window.resize(220, 100);
    settle();
    EXPECT_TRUE(isWhole(box->frame(), 220, 100));
    EXPECT_EQ(box->frame().width, 220.0);
    EXPECT_TRUE(box->viewport()->rect().contains(box->cursorRect()));

    const Rect small = box->frame();
    window.resize(width, height);
    settle();
    EXPECT_EQ(box->frame(), small);
}

TEST_F(TnTextBoxPlaceTest, windowThatShrinksShowsTheCaretOfATextThatIsHigherThanIt)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("1\n2\n3\n4\n5\n6"));
    ASSERT_EQ(box->verticalScrollBar()->maximum(), 0);

    window.resize(width, 80);
    settle();

    EXPECT_EQ(box->frame().height, 80.0);
    EXPECT_TRUE(box->viewport()->rect().contains(box->cursorRect()));
}

TEST_F(TnTextBoxPlaceTest, windowThatGrowsOneWayLeavesANewBoxInItsFrame)
{
    const auto box = newBox({ 250, 10 });
    const Rect size = canvas->frame();

    canvas->setFrame({ size.x, size.y, size.width + 20, size.height });
    EXPECT_EQ(box->frame(), (Rect { 250, -14, 200, 30 }));
    canvas->setFrame({ size.x, size.y, size.width + 20, size.height + 20 });
    EXPECT_EQ(box->frame(), (Rect { 250, -14, 200, 30 }));
}

TEST_F(TnTextBoxPlaceTest, windowThatShrinksBringsAnEmptyBoxAlong)
{
    const auto box = newBox();

    window.resize(240, 110);
    settle();

    EXPECT_EQ(box->frame(), (Rect { 19, 59, 200, 30 }));
}

TEST_F(TnTextBoxPlaceTest, windowThatGrowsLeavesANewBoxInItsFrame)
{
    const auto box = newBox({ 250, 10 });

    window.resize(width + 20, height + 20);
    settle();

    EXPECT_EQ(box->frame(), (Rect { 250, -14, 200, 30 }));
}

TEST_F(TnTextBoxPlaceTest, windowThatShrinksLeavesAPlacedBoxWhereItIs)
{
    const auto box = placedBox();
    const Rect before = box->frame();

    window.resize(240, 110);
    settle();

    EXPECT_EQ(box->frame(), before);
}

// Dragged out of reach

TEST_F(TnTextBoxPlaceTest, boxDraggedOutOfReachComesBackOnceTheDragHasEnded)
{
    const auto box = placedBox();
    const QPointF grabbed(30, 10);
    pressOn(*box, grabbed);
    dragOn(*box, grabbed + QPointF(500, 500));
    EXPECT_EQ(box->frame().x, 520.0);

    releaseOn(*box, grabbed);

    EXPECT_EQ(box->frame().x, 280.0);
    EXPECT_EQ(box->frame().maxY(), 20.0);
}

TEST_F(TnTextBoxPlaceTest, boxDraggedPartlyOutStaysThere)
{
    const auto box = placedBox();

    drag(*box, { -100, 0 });

    EXPECT_EQ(box->frame().x, -80.0);
}

TEST_F(TnTextBoxPlaceTest, boxThatIsPartlyOutComesInWithTheNextLetter)
{
    const auto box = placedBox();
    drag(*box, { -100, 0 });
    doubleClickOn(*box, { 120, 15 });
    EXPECT_EQ(box->frame().x, -80.0);

    QTest::keyClicks(box.get(), QStringLiteral("a"));

    EXPECT_EQ(box->frame().x, 0.0);
}

} // namespace
} // namespace penwick::test
