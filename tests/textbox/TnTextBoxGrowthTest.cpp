// SPDX-License-Identifier: MIT
// A box that grows and shrinks with what is written in it, and where its text stands.
#include "textbox/TextBoxFixture.h"

#include <QAbstractTextDocumentLayout>
#include <QScrollBar>
#include <QTextBlock>
#include <QTextLayout>

namespace penwick::test {
namespace {

class TnTextBoxGrowthTest : public TextBoxFixture
{
protected:
    /// The height of a box with that many lines.
    static double heightOf(const TnTextBox &box, int lines)
    {
        return std::max(30.0, 6.0 + lines * lineHeight(box) + 3.0);
    }

    static double lineHeight(const TnTextBox &box)
    {
        return box.document()->firstBlock().layout()->lineAt(0).height();
    }

    static int lineCount(const TnTextBox &box)
    {
        int lines = 0;
        for (QTextBlock block = box.document()->begin(); block.isValid(); block = block.next())
            lines += block.layout()->lineCount();
        return lines;
    }

    /// Columns of the box's picture between the first and the last with ink, its border apart.
    static std::pair<int, int> inkedColumns(const QImage &picture)
    {
        std::pair<int, int> columns { picture.width(), -1 };
        for (int column = 3; column < picture.width() - 3; ++column) {
            for (int row = 3; row < picture.height() - 3; ++row) {
                if (qRed(picture.pixel(column, row)) < 128) {
                    columns.first = std::min(columns.first, column);
                    columns.second = std::max(columns.second, column);
                }
            }
        }
        return columns;
    }
};

TEST_F(TnTextBoxGrowthTest, boxIsAsItWasMadeUntilTheFirstEdit)
{
    const auto box = newBox();
    settle();

    EXPECT_EQ(box->frame(), (Rect { 20, 100, 200, 30 }));
    EXPECT_EQ(box->verticalScrollBar()->value(), 0);
}

TEST_F(TnTextBoxGrowthTest, boxIsAsHighAsItsLineOfText)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("a"));

    const double oneLine = heightOf(*box, 1);
    EXPECT_EQ(box->frame(), (Rect { 20, 130 - oneLine, 200, oneLine }));
    EXPECT_EQ(box->verticalScrollBar()->maximum(), 0);
}

TEST_F(TnTextBoxGrowthTest, smallLineLeavesTheBoxAtItsLeastHeight)
{
    canvas->setTextFontSize(12.0);
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("a"));

    EXPECT_EQ(box->frame(), (Rect { 20, 100, 200, 30 }));
}

TEST_F(TnTextBoxGrowthTest, boxGrowsToTheRightFirst)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QString(11, QLatin1Char('m')));

    const double boxWidth = box->frame().width;
    EXPECT_GT(boxWidth, 200.0);
    EXPECT_LT(boxWidth, 280.0);
    EXPECT_EQ(lineCount(*box), 1);
    EXPECT_EQ(box->frame().x, std::min(20.0, 300.0 - 21.0 - boxWidth)); // its button is seen
    EXPECT_EQ(box->frame().maxY(), 130.0);
}

TEST_F(TnTextBoxGrowthTest, textNeverWrapsBeforeTheBoxIsAsWideAsTheCanvas)
{
    const auto box = newBox();

    for (const QChar letter : QStringLiteral("The quick brown fox jumps over")) {
        QTest::keyClicks(box.get(), QString(letter));
        if (lineCount(*box) > 1)
            break;
    }

    EXPECT_EQ(lineCount(*box), 2);
    EXPECT_GT(box->frame().width, 200.0);
    const QString text = box->toPlainText();
    EXPECT_GT(QFontMetrics(box->font()).horizontalAdvance(text), 300 - 2 * 5) << text.toStdString();
}

TEST_F(TnTextBoxGrowthTest, asWideAsTheCanvasItGrowsDownwardsByWrapping)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("The quick brown fox jumps over"));

    const int lines = lineCount(*box);
    EXPECT_EQ(lines, 2);
    EXPECT_EQ(box->frame().width, 300.0);
    EXPECT_EQ(box->frame().height, heightOf(*box, lines));
    EXPECT_EQ(box->frame().x, 0.0);
    EXPECT_EQ(box->frame().maxY(), 130.0);
    EXPECT_EQ(box->verticalScrollBar()->maximum(), 0);
}

TEST_F(TnTextBoxGrowthTest, oneLongWordIsBrokenAtTheCanvasEdge)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QString(30, QLatin1Char('m')));

    EXPECT_EQ(lineCount(*box), 3);
    EXPECT_EQ(box->frame().maxX(), 300.0);
}

TEST_F(TnTextBoxGrowthTest, whatIsHigherThanTheCanvasScrollsAndTheCaretIsSeen)
{
    const auto box = newBox();

    paste(*box, QStringLiteral("1\n2\n3\n4\n5\n6\n7\n8"));

    EXPECT_EQ(box->frame(), (Rect { 20, 0, 200, 200 }));
    EXPECT_TRUE(box->viewport()->rect().contains(box->cursorRect()));
    EXPECT_EQ(box->toPlainText(), QStringLiteral("1\n2\n3\n4\n5\n6\n7\n8"));

    QTest::keyClick(box.get(), Qt::Key_Home, Qt::ControlModifier);
    EXPECT_TRUE(box->viewport()->rect().contains(box->cursorRect()));
}

TEST_F(TnTextBoxGrowthTest, boxShrinksBackToItsLeastWidthAndOneLine)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("The quick brown fox jumps over\nthe lazy dog"));

    box->selectAll();
    QTest::keyClicks(box.get(), QStringLiteral("a"));

    const double oneLine = heightOf(*box, 1);
    EXPECT_EQ(box->frame(), (Rect { 0, 130 - oneLine, 200, oneLine })); // where it has moved
    EXPECT_EQ(box->verticalScrollBar()->value(), 0);
}

TEST_F(TnTextBoxGrowthTest, smallTextShrinksBackTo200By30)
{
    canvas->setTextFontSize(12.0);
    const auto box = newBox();
    paste(*box, QStringLiteral("1\n2\n3"));
    ASSERT_GT(box->frame().height, 30.0);

    box->selectAll();
    QTest::keyClick(box.get(), Qt::Key_Backspace);

    EXPECT_EQ(box->frame(), (Rect { 20, 100, 200, 30 }));
}

TEST_F(TnTextBoxGrowthTest, deleteButtonKeepsToTheCornerOfABoxThatGrows)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QString(11, QLatin1Char('m')));
    settle();

    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { box->frame().maxX() + 1, 131, 20, 20 }));
}

TEST_F(TnTextBoxGrowthTest, boxNearTheRightEdgeGrowsToTheLeft)
{
    const auto box = newBox({ 200, 124 });

    QTest::keyClicks(box.get(), QStringLiteral("The quick brown fox"));

    EXPECT_GT(box->frame().width, 200.0);
    EXPECT_EQ(box->frame().maxX(), 279.0);
    EXPECT_EQ(box->frame().maxY(), 130.0);
    EXPECT_EQ(lineCount(*box), 1);
}

TEST_F(TnTextBoxGrowthTest, boxThatWasMovedGrowsFromWhereItStands)
{
    const auto box = placedBox();
    pressOn(*box, { 30, 10 });
    dragOn(*box, { 50, 40 });
    releaseOn(*box, { 30, 10 });
    doubleClickOn(*box, { 20, 15 });
    QTest::keyClick(box.get(), Qt::Key_End);

    QTest::keyClicks(box.get(), QStringLiteral(" World and more"));

    EXPECT_LT(box->frame().x, 40.0);
    EXPECT_EQ(box->frame().maxY(), 100.0);
    EXPECT_LE(box->frame().maxX(), 300.0);
    EXPECT_EQ(box->frame().height, heightOf(*box, 1));
}

TEST_F(TnTextBoxGrowthTest, textFromRightToLeftStandsAtTheRightEdgeOfTheBox)
{
    const auto box = newBox();

    paste(*box, QStringLiteral("שלום"));
    leave();

    EXPECT_EQ(box->frame().width, 200.0);
    const auto [first, last] = inkedColumns(pictureOf(*box));
    EXPECT_GT(first, 100);
    EXPECT_GE(last, 190);
    EXPECT_LT(last, 195);
}

TEST_F(TnTextBoxGrowthTest, textFromLeftToRightStandsAtTheLeftEdgeOfTheBox)
{
    const auto box = placedBox();

    const auto [first, last] = inkedColumns(pictureOf(*box));
    EXPECT_GE(first, 5);
    EXPECT_LT(first, 10);
    EXPECT_LT(last, 100);
}

TEST_F(TnTextBoxGrowthTest, longTextFromRightToLeftGrowsLikeAnyOther)
{
    const auto box = newBox();

    paste(*box, QStringLiteral("שלום שלום שלום שלום שלום שלום"));

    EXPECT_GT(box->frame().width, 200.0);
    EXPECT_EQ(box->frame().x, 0.0);
    EXPECT_EQ(lineCount(*box), 2);
    EXPECT_EQ(box->frame().height, heightOf(*box, 2));
}

TEST_F(TnTextBoxGrowthTest, boxesAndStrokesKeepTheirPlaceAtTheBottomLeftWhenTheWindowIsResized)
{
    stroke({ { 50, 20 }, { 100, 20 } });
    const auto box = placedBox();
    const Rect before = box->frame();
    const QImage picture = pictureOf(*box);

    window.resize(400, 320);
    settle();

    EXPECT_EQ(box->frame(), before);
    EXPECT_EQ(box->geometry().topLeft(), QPoint(20, 320 - 130));
    EXPECT_EQ(pictureOf(*box), picture);
    EXPECT_EQ(qRed(onScreen().pixel(75, 320 - 20)), ink);

    window.resize(width, height);
    settle();
    EXPECT_EQ(box->geometry().topLeft(), QPoint(20, 200 - 130));
}

TEST_F(TnTextBoxGrowthTest, linesThatAreBegunByHandAreNotTakenForWrappedOnes)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    QTest::keyClick(box.get(), Qt::Key_Return, Qt::ShiftModifier);
    QTest::keyClicks(box.get(), QStringLiteral("b"));

    EXPECT_EQ(lineCount(*box), 2);
    EXPECT_EQ(box->frame().width, 200.0);
}

TEST_F(TnTextBoxGrowthTest, boxOnNoCanvasStaysAsItIs)
{
    const auto box = TnTextBox::create({ 1, 2, 200, 30 }, 20.0, Qt::black);

    box->insertPlainText(QStringLiteral("longer than the box is wide, if it were on a canvas"));

    EXPECT_EQ(box->frame(), (Rect { 1, 2, 200, 30 }));
}

TEST_F(TnTextBoxGrowthTest, boxStaysWhereItIsWhenItsCanvasGrowsInOneWayAndNotInTheOther)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    const Rect before = box->frame();
    const Rect size = canvas->frame();

    canvas->setFrame({ size.x, size.y, size.width + 50, size.height });
    EXPECT_EQ(box->frame(), before);
    canvas->setFrame({ size.x, size.y, size.width + 50, before.maxY() });

    EXPECT_LT(box->frame().maxY(), before.maxY()) << "its delete button is seen";
}

TEST_F(TnTextBoxGrowthTest, emptyLineBegunByHandIsNotTakenForAWrappedOne)
{
    const auto box = newBox();

    QTest::keyClick(box.get(), Qt::Key_Return, Qt::ShiftModifier);
    QTest::keyClicks(box.get(), QStringLiteral("a"));

    EXPECT_EQ(box->frame().width, 200.0);
    EXPECT_EQ(lineCount(*box), 2);
}

TEST_F(TnTextBoxGrowthTest, keyInATextThatFillsTheCanvasLaysItOutOnce)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("The quick brown fox jumps over the lazy dog. ").repeated(20));
    ASSERT_EQ(box->frame().size(), (platform::Size { 300, 200 }));
    int layouts = 0;
    const QObject context; // goes before what it counts in
    QObject::connect(box->document()->documentLayout(), &QAbstractTextDocumentLayout::update,
        &context, [&] { ++layouts; });

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    const int once = layouts;
    box->document()->setTextWidth(box->document()->textWidth()); // as the toolkit does
    ASSERT_EQ(layouts, once + 1);

    EXPECT_EQ(once, 1);
}

} // namespace
} // namespace penwick::test
