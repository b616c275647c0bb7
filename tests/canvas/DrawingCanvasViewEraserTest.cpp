// SPDX-License-Identifier: MIT
// An eraser that goes farther from one event to the next than a stroke is thick.
#include "canvas/CanvasFixture.h"

namespace penwick::test {
namespace {

const QString eraser = QStringLiteral("eraser");

class FastEraser : public CanvasFixture
{
protected:
    std::int64_t lineAcross(double y) { return stroke({ { 20, y }, { 200, y } }); }

    /// The eraser is put down at `point`.
    void putDown(Point point)
    {
        canvas->setCurrentSelectedTool(eraser);
        static_cast<void>(recorder.take());
        press(point);
    }

    /// The strokes that were erased, in that order.
    [[nodiscard]] Ids erased() const
    {
        Ids identifiers;
        for (const UndoRedoState &record : history().undoStack()) {
            if (record.actionAssociated == ActionType::erase)
                identifiers.push_back(record.elementId);
        }
        return identifiers;
    }
};

TEST_F(FastEraser, oneDragAcrossThreeStrokesErasesEachInTheOrderOfCrossing)
{
    const std::int64_t upper = lineAcross(150);
    const std::int64_t lower = lineAcross(50);
    const std::int64_t middle = lineAcross(100);
    putDown({ 100, 30 });

    drag({ 100, 180 });

    EXPECT_EQ(erased(), (Ids { lower, middle, upper }));
    EXPECT_TRUE(canvas->pathArray().isEmpty());
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo false", "enableUndo true", "enableRedo false",
            "enableUndo true", "enableRedo false" }));
    settle();
    EXPECT_EQ(onScreen(), blank());
}

TEST_F(FastEraser, strokesBesideTheWayStay)
{
    const Ids kept { stroke({ { 20, 50 }, { 90, 50 } }), stroke({ { 110, 50 }, { 200, 50 } }) };
    putDown({ 100, 30 });

    drag({ 100, 180 });

    EXPECT_EQ(idsOf(model().pathArray()), kept);
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(FastEraser, strokesUnderOnePointGetAnEventEachTheOldestFirst)
{
    const Ids strokes { lineAcross(100), lineAcross(100), lineAcross(100) };
    putDown({ 100, 30 });

    drag({ 100, 180 });

    EXPECT_EQ(erased(), strokes);
}

TEST_F(FastEraser, ofStrokesThatAreEnteredAtTheEndTheOldestGoesAndTheOthersWaitForTheNextEvent)
{
    const std::int64_t older = lineAcross(100);
    const std::int64_t newer = lineAcross(100);
    putDown({ 100, 30 });

    drag({ 100, 97.5 });
    EXPECT_EQ(erased(), Ids { older });
    drag({ 100, 97.5 });
    EXPECT_EQ(erased(), (Ids { older, newer }));
}

TEST_F(FastEraser, strokeThatLiesUnderThePressGoesWithTheFirstDrag)
{
    const Ids strokes { lineAcross(100), lineAcross(101), lineAcross(50) };
    putDown({ 100, 100 });
    EXPECT_EQ(erased(), Ids());

    drag({ 100, 180 });

    EXPECT_EQ(erased(), (Ids { strokes[0], strokes[1] }));
    EXPECT_EQ(idsOf(model().pathArray()), Ids { strokes[2] });
}

TEST_F(FastEraser, strokeThatLiesOverAnotherGoesWhenItIsMetNotBecauseOfItsAge)
{
    const std::int64_t below = stroke({ { 20, 100 }, { 200, 100 } });
    const std::int64_t over = stroke({ { 100, 60 }, { 100, 140 } });
    putDown({ 100, 30 });

    drag({ 100, 120 }); // along the newer one, which it meets first, through the older one

    EXPECT_EQ(erased(), (Ids { over, below }));
}

TEST_F(FastEraser, whatUndoBroughtBackOverTheOthersIsMetLikeThem)
{
    const Ids strokes { lineAcross(50), lineAcross(100) };
    putDown({ 100, 30 });
    drag({ 100, 70 });
    release({ 100, 70 });
    controller->handleToolSelection(QStringLiteral("undo")); // the first is now the newest
    ASSERT_EQ(idsOf(model().pathArray()), (Ids { strokes[1], strokes[0] }));
    putDown({ 100, 180 });

    drag({ 100, 30 });

    EXPECT_EQ(erased(), (Ids { strokes[1], strokes[0] }));
}

TEST_F(FastEraser, wayToTheReleaseCountsToo)
{
    lineAcross(100);
    putDown({ 100, 30 });

    release({ 100, 180 });

    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(FastEraser, wayFromOnePressToTheNextErasesNothing)
{
    const std::int64_t kept = lineAcross(100);
    putDown({ 100, 30 });
    drag({ 100, 40 });
    release({ 100, 40 });

    press({ 100, 180 });
    drag({ 100, 170 });
    release({ 100, 170 });

    EXPECT_EQ(idsOf(model().pathArray()), Ids { kept });
}

TEST_F(FastEraser, wayThatMeetsNothingMarksNothing)
{
    lineAcross(100);
    putDown({ 100, 30 });
    settle();
    PaintRecorder painted(*canvas);

    drag({ 20, 90 });
    drag({ 200, 90 });

    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect>());
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(FastEraser, brushLeavesWhatItCrosses)
{
    const std::int64_t kept = lineAcross(100);

    stroke({ { 100, 30 }, { 100, 180 } });

    EXPECT_EQ(model().pathArray().first().pathId, kept);
    EXPECT_EQ(erased(), Ids());
}

} // namespace
} // namespace penwick::test
