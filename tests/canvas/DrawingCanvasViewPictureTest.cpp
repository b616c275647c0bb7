// SPDX-License-Identifier: MIT
// What is on the screen after the brush was used.
#include "canvas/CanvasFixture.h"

namespace penwick::test {
namespace {

using DrawingCanvasViewPictureTest = CanvasFixture;

TEST_F(DrawingCanvasViewPictureTest, strokeIsBlackAtSevenTenthsAndFiveWideWithRoundEnds)
{
    stroke({ { 50, 100.5 }, { 150, 100.5 } });

    const QImage picture = onScreen();
    std::vector<int> across;
    for (int y = 96; y < 106; ++y)
        across.push_back(greyAt(picture, { 100, static_cast<double>(y) }));
    EXPECT_EQ(
        across, (std::vector<int> { paper, paper, ink, ink, ink, ink, ink, paper, paper, paper }));
    EXPECT_EQ(greyAt(picture, { 48, 100 }), ink); // the round end
    EXPECT_EQ(greyAt(picture, { 46, 100 }), paper);
    EXPECT_GT(greyAt(picture, { 48, 98 }), ink); // its corner
    EXPECT_EQ(darkest(picture), ink);
}

TEST_F(DrawingCanvasViewPictureTest, strokeIsNowhereDarkerWhereItsSegmentsMeetOrItCrossesItself)
{
    canvas->setBrushThickness(12.0);

    stroke({ { 50, 100 }, { 90, 140 }, { 130, 60 }, { 131, 61 }, { 60, 120 }, { 55, 30 },
        { 100, 150 } });

    EXPECT_EQ(darkest(onScreen()), ink);
}

TEST_F(DrawingCanvasViewPictureTest, strokeThatIsRetracedIsNotDarkerForIt)
{
    const QRect alongIt(60, 80, 80, 40);
    stroke({ { 50, 100.5 }, { 150, 100.5 } });
    const QImage once = onScreen().copy(alongIt);
    controller->handleToolSelection(QStringLiteral("undo"));
    settle();
    ASSERT_EQ(onScreen(), blank());

    stroke({ { 50, 100.5 }, { 150, 100.5 }, { 100, 100.5 }, { 150, 100.5 }, { 50, 100.5 } });

    EXPECT_EQ(onScreen().copy(alongIt), once);
    EXPECT_EQ(darkest(onScreen()), ink);
    EXPECT_EQ(canvas->pathArray().size(), 1); // it ended where it began, but it was dragged
}

TEST_F(DrawingCanvasViewPictureTest, pointerThatStaysLeavesARoundDotOfTheBrushsWidth)
{
    canvas->setBrushThickness(9.0);

    stroke({ { 60.5, 100.5 }, { 60.5, 100.5 } });

    const QImage picture = onScreen();
    EXPECT_EQ(darkest(picture), ink);
    for (const double x : { 57.0, 60.0, 63.0 })
        EXPECT_EQ(greyAt(picture, { x, 100 }), ink) << x;
    EXPECT_EQ(greyAt(picture, { 55, 100 }), paper);
    EXPECT_EQ(greyAt(picture, { 66, 100 }), paper);
    EXPECT_GT(greyAt(picture, { 56, 96 }), 200); // round, not square
}

TEST_F(DrawingCanvasViewPictureTest, twoStrokesThatCrossAreDarkerThere)
{
    stroke({ { 50, 100.5 }, { 150, 100.5 } });
    stroke({ { 100.5, 50 }, { 100.5, 150 } });

    const QImage picture = onScreen();
    EXPECT_EQ(greyAt(picture, { 70, 100 }), ink);
    EXPECT_EQ(greyAt(picture, { 100, 70 }), ink);
    // 0.7 of 41 over 105 would be 60. But the strokes are first laid over each other in a
    // transparent picture, whose pixels are rounded too.
    EXPECT_EQ(greyAt(picture, { 100, 100 }), 61);
}

TEST_F(DrawingCanvasViewPictureTest, laterStrokesArePaintedOverEarlierOnes)
{
    canvas->setBrushThickness(20.0);
    canvas->setBrushColor(Qt::red);
    stroke({ { 50, 100 }, { 150, 100 } });
    canvas->setBrushColor(Qt::blue);
    stroke({ { 100, 50 }, { 100, 150 } });

    const QColor crossing = onScreen().pixelColor(100, 100);
    EXPECT_GT(crossing.blue(), 180);
    EXPECT_LT(crossing.red(), 100);
}

TEST_F(DrawingCanvasViewPictureTest, canvasThatCoversItsWindowPaintsTheWindowsBackground)
{
    platform::WindowAttributes attributes = window.attributes();
    attributes.backgroundColor = QColor(255, 220, 0);
    window.setAttributes(attributes);
    canvas->setCoversWindow(true);
    settle();
    EXPECT_EQ(onScreen().pixelColor(100, 100), QColor(255, 220, 0));

    stroke({ { 50, 100.5 }, { 150, 100.5 } });
    EXPECT_EQ(onScreen().pixelColor(100, 50), QColor(255, 220, 0));
    EXPECT_EQ(onScreen().pixelColor(100, 99), QColor(105, 95, 29)); // 0.7 of (41, 41, 41) over it

    attributes.backgroundColor = Qt::white; // the host may change its mind
    window.setAttributes(attributes);
    settle();
    EXPECT_EQ(greyAt(onScreen(), { 100, 50 }), paper);
    EXPECT_EQ(greyAt(onScreen(), { 100, 100 }), ink);
}

TEST_F(DrawingCanvasViewPictureTest, pieceByPieceTheScreenShowsWhatAFullRepaintGives)
{
    stroke({ { 20, 20 }, { 250, 180 }, { 40, 170 } });
    press({ 200, 30 });
    for (int step = 0; step < 20; ++step) {
        drag({ 200.0 - 9 * step, 30.0 + (step % 3) * 40 });
        settle();
        const QImage pieces = onScreen();
        ASSERT_EQ(pieces, window.grab().toImage().convertToFormat(pieces.format())) << step;
    }
}

} // namespace
} // namespace penwick::test
