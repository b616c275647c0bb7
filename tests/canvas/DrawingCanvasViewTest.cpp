// SPDX-License-Identifier: MIT
// What a canvas starts with, and the brush and the popover under the pointer.
#include "canvas/CanvasFixture.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {
namespace {

const QString eraser = QStringLiteral("eraser");

using DrawingCanvasViewTest = CanvasFixture;

// What it starts with

TEST_F(DrawingCanvasViewTest, newCanvasHasABlackBrushOfFiveAndNothingOnIt)
{
    for (const bool ofFrame : { true, false }) {
        const auto view = ofFrame ? std::make_unique<DrawingCanvasView>(Rect { 1, 2, 30, 40 })
                                  : std::make_unique<DrawingCanvasView>();

        EXPECT_EQ(view->lastPoint(), Point());
        EXPECT_EQ(view->startPoint(), Point());
        EXPECT_FALSE(view->isDragged());
        EXPECT_EQ(view->brushThickness(), 5.0);
        EXPECT_EQ(view->textFontSize(), 24.0);
        EXPECT_EQ(view->brushColor(), QColor(41, 41, 41));
        EXPECT_TRUE(view->pathArray().isEmpty());
        EXPECT_TRUE(view->textBoxArray().isEmpty());
        EXPECT_EQ(view->currentSelectedTool(), QStringLiteral("brush"));
        EXPECT_EQ(view->lastSelecedTool(), QStringLiteral("brush"));
        EXPECT_EQ(view->cursorType(), platform::Cursor::arrow());
        EXPECT_EQ(view->textBoxView(), nullptr);
        EXPECT_EQ(view->popoverWindow(), nullptr);
        EXPECT_EQ(view->drawingCanvasDelegate(), nullptr);
    }
    EXPECT_EQ(DrawingCanvasView(Rect { 1, 2, 30, 40 }).frame(), (Rect { 1, 2, 30, 40 }));
}

TEST_F(DrawingCanvasViewTest, whatIsStoredCanBeSet)
{
    const auto view = platform::makeView<PlainView>();

    canvas->setLastPoint({ 1, 2 });
    canvas->setStartPoint({ 3, 4 });
    canvas->setIsDragged(true);
    canvas->setTextBoxView(view);

    EXPECT_EQ(canvas->lastPoint(), (Point { 1, 2 }));
    EXPECT_EQ(canvas->startPoint(), (Point { 3, 4 }));
    EXPECT_TRUE(canvas->isDragged());
    EXPECT_EQ(canvas->textBoxView(), view);
    EXPECT_TRUE(canvas->subviews().empty()); // it is only kept
}

// Brush

TEST_F(DrawingCanvasViewTest, brushPressBeginsAStrokeInTheModelAndTakesTheFirstResponder)
{
    canvas->setBrushColor(QColor(10, 20, 30));
    canvas->setBrushThickness(8.0);

    press({ 50, 60 });

    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(canvas->startPoint(), (Point { 50, 60 }));
    EXPECT_FALSE(canvas->isDragged());
    ASSERT_EQ(model().pathArray().size(), 1);
    const StrokeEntry &entry = model().pathArray().last();
    EXPECT_EQ(entry.bPath->elementCount(), 0);
    EXPECT_EQ(entry.bPath->lineWidth(), 8.0);
    EXPECT_EQ(entry.bPathParams.startPoint, (Point { 50, 60 }));
    EXPECT_EQ(entry.bPathParams.pathColor->rgb(), qRgb(10, 20, 30));
    EXPECT_NEAR(entry.bPathParams.pathColor->alphaF(), 0.7, 1e-4);
    EXPECT_TRUE(canvas->pathArray().isEmpty()); // the copy follows with the first drag
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));
}

TEST_F(DrawingCanvasViewTest, strokesOpacityIsSevenTenthsWhateverTheColoursOwn)
{
    canvas->setBrushColor(QColor(10, 20, 30, 40));

    press({ 50, 60 });

    EXPECT_NEAR(model().pathArray().last().bPathParams.pathColor->alphaF(), 0.7, 1e-4);
}

TEST_F(DrawingCanvasViewTest, hairlineMarksItsSmoothEdgeWhichIsWiderThanItsBoxGrownByTheWidth)
{
    canvas->setBrushThickness(0.5);
    settle();
    PaintRecorder painted(*canvas);
    press({ 50.5, 60.5 });
    drag({ 80.5, 60.5 });
    settle();
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 49, 200 - 62, 33, 3 } }));

    drag({ 80.5, 70.5 });
    settle();
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 79, 200 - 72, 3, 13 } }));
}

TEST_F(DrawingCanvasViewTest, eachBrushDragAddsASegmentAndMarksOnlyItsBoxGrownByTheWidth)
{
    contentOf(window).makeFirstResponder(canvas);
    settle();
    PaintRecorder painted(*canvas);
    press({ 50, 60 });
    static_cast<void>(recorder.take());

    drag({ 80, 70 });
    EXPECT_EQ(canvas->lastPoint(), (Point { 80, 70 }));
    EXPECT_EQ(canvas->startPoint(), (Point { 80, 70 }));
    EXPECT_TRUE(canvas->isDragged());
    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 2);
    settle();
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 45, 200 - 75, 40, 20 } }));

    drag({ 70, 100.5 });
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 4);
    settle();
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 65, 200 - 106, 20, 41 } }));
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasViewTest, brushReleaseAfterADragEndsTheStrokeAndRepaintsTheWholeCanvas)
{
    PaintRecorder painted(*canvas);
    press({ 50, 60 });
    drag({ 80, 70 });
    settle();
    static_cast<void>(painted.take());
    static_cast<void>(recorder.take());

    release({ 80, 70 });

    EXPECT_EQ(canvas->lastPoint(), (Point { 80, 70 }));
    EXPECT_FALSE(canvas->isDragged());
    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    settle();
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 0, 0, width, height } }));
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasViewTest, wholeStrokeIsOneRecord)
{
    const std::int64_t id = stroke({ { 10, 10 }, { 20, 20 }, { 30, 10 }, { 40, 20 } });

    ASSERT_EQ(history().undoStack().size(), 1);
    EXPECT_EQ(history().undoStack().last().elementId, id);
    EXPECT_EQ(history().undoStack().last().actionAssociated, ActionType::draw);
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));
}

TEST_F(DrawingCanvasViewTest, releaseElsewhereWithoutADragKeepsTheCopyAndRepaints)
{
    stroke({ { 10, 10 }, { 20, 20 } });
    PaintRecorder painted(*canvas);
    press({ 50, 60 });

    release({ 70, 60 });
    settle();

    EXPECT_EQ(canvas->lastPoint(), (Point { 70, 60 }));
    EXPECT_EQ(canvas->pathArray().size(), 1);
    EXPECT_EQ(model().pathArray().size(), 2);
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 0, 0, width, height } }));
}

TEST_F(DrawingCanvasViewTest, clickWithoutADragLeavesNoMarkButAnEmptyStrokeWithItsRecord)
{
    contentOf(window).makeFirstResponder(canvas);
    settle();
    PaintRecorder painted(*canvas);

    click({ 50, 60 });
    settle();

    EXPECT_EQ(onScreen(), blank());
    EXPECT_EQ(painted.take(), std::vector<QRect>()); // nothing is marked
    EXPECT_TRUE(canvas->pathArray().isEmpty());
    EXPECT_EQ(canvas->lastPoint(), (Point { 50, 60 }));
    ASSERT_EQ(model().pathArray().size(), 1);
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 0);
    ASSERT_EQ(history().undoStack().size(), 1);
    EXPECT_EQ(history().undoStack().last().actionAssociated, ActionType::draw);
    EXPECT_EQ(recorder.take(), (Posts { "enableUndo true", "enableRedo false" }));

    canvas->setNeedsDisplay();
    settle();
    EXPECT_EQ(onScreen(), blank());
}

TEST_F(DrawingCanvasViewTest, clickWithoutADragDropsTheCopysLastEntryYetNoEarlierStrokeVanishes)
{
    const std::int64_t first = stroke({ { 20, 50.5 }, { 200, 50.5 } });
    const std::int64_t second = stroke({ { 20, 100.5 }, { 200, 100.5 } });
    const QImage before = onScreen();

    click({ 150, 150 });
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids { first });
    settle();
    EXPECT_EQ(onScreen(), before);

    canvas->setNeedsDisplay();
    settle();
    EXPECT_EQ(onScreen(), before);
    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    EXPECT_EQ(
        idsOf(canvas->pathArray()), (Ids { first, second, model().pathArray().last().pathId }));
}

TEST_F(DrawingCanvasViewTest, strokeAfterAClickIsPaintedLikeAnyOther)
{
    click({ 150, 150 });
    static_cast<void>(recorder.take());

    stroke({ { 20, 50.5 }, { 200, 50.5 } });

    EXPECT_EQ(greyAt(onScreen(), { 100, 50 }), ink);
    EXPECT_EQ(canvas->pathArray().size(), 2);
    EXPECT_EQ(model().pathArray().size(), 2);
}

TEST_F(DrawingCanvasViewTest, dragOfAPixelIsADrag)
{
    stroke({ { 50, 60 }, { 51, 60 } });

    EXPECT_EQ(canvas->pathArray().size(), 1);
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 2);
    EXPECT_EQ(greyAt(onScreen(), { 50, 60 }), ink);
}

TEST_F(DrawingCanvasViewTest, brushDragWithoutADelegateMovesOnlyTheViewsOwnPoints)
{
    press({ 50, 60 });
    canvas->setDrawingCanvasDelegate(nullptr);

    drag({ 80, 70 });

    EXPECT_EQ(canvas->lastPoint(), (Point { 80, 70 }));
    EXPECT_EQ(canvas->startPoint(), (Point { 80, 70 }));
    EXPECT_TRUE(canvas->isDragged());
    EXPECT_TRUE(canvas->pathArray().isEmpty());
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 0);
}

TEST_F(DrawingCanvasViewTest, rightAndMiddleButtonNeitherDrawNorBreakAStroke)
{
    for (const Qt::MouseButton button : { Qt::RightButton, Qt::MiddleButton }) {
        press({ 50, 60 }, button);
        drag({ 80, 70 }, button);
        release({ 80, 70 }, button);
    }
    settle();
    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(canvas->lastPoint(), Point());
    EXPECT_EQ(recorder.take(), Posts());
    EXPECT_EQ(onScreen(), blank());

    press({ 20, 50.5 });
    drag({ 100, 50.5 });
    press({ 100, 50.5 }, Qt::MiddleButton);
    release({ 100, 50.5 }, Qt::MiddleButton);
    EXPECT_TRUE(canvas->isDragged());
    drag({ 200, 50.5 });
    release({ 200, 50.5 });
    settle();
    ASSERT_EQ(model().pathArray().size(), 1);
    EXPECT_EQ(model().pathArray().last().bPath->elementCount(), 4);
    EXPECT_EQ(greyAt(onScreen(), { 150, 50 }), ink);
}

TEST_F(DrawingCanvasViewTest, moveWithoutAPressDrawsNothing)
{
    drag({ 80, 70 });

    EXPECT_EQ(canvas->lastPoint(), Point());
    EXPECT_FALSE(canvas->isDragged());
    EXPECT_TRUE(model().pathArray().isEmpty());
}

// Other tools

TEST_F(DrawingCanvasViewTest, unknownToolDoesNothingButTakeTheFirstResponderWhenDragged)
{
    const std::int64_t kept = stroke({ { 20, 50 }, { 200, 50 } });
    static_cast<void>(recorder.take());
    contentOf(window).makeFirstResponder(nullptr);
    for (const char *const tool : { "color", "state", "Brush", "" }) {
        canvas->setCurrentSelectedTool(QString::fromLatin1(tool));
        press({ 50, 50 });
        EXPECT_EQ(contentOf(window).firstResponder(), nullptr) << tool;
        drag({ 60, 50 });
        EXPECT_EQ(contentOf(window).firstResponder(), canvas) << tool;
        release({ 60, 50 });
        contentOf(window).makeFirstResponder(nullptr);
    }

    EXPECT_EQ(idsOf(model().pathArray()), Ids { kept });
    EXPECT_EQ(canvas->lastPoint(), (Point { 200, 50 }));
    EXPECT_EQ(recorder.take(), Posts());
}

// Popover

TEST_F(DrawingCanvasViewTest, pressInTheKeyWindowHidesThePopoverAndDrawsWithTheLastTool)
{
    platform::Window popover;
    popover.show();
    activate(window);
    canvas->setPopoverWindow(&popover);
    canvas->setCurrentSelectedTool(QStringLiteral("color"));
    ASSERT_TRUE(contentOf(window).isKeyWindow());

    press({ 50, 60 });

    EXPECT_FALSE(popover.isVisible());
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("brush"));
    EXPECT_EQ(model().pathArray().size(), 1);
}

TEST_F(DrawingCanvasViewTest, pressInTheKeyWindowRestoresTheLastToolThoughThePopoverIsNotShown)
{
    platform::Window popover;
    canvas->setPopoverWindow(&popover);
    canvas->setLastSelecedTool(eraser);
    canvas->setCurrentSelectedTool(QStringLiteral("no such tool"));

    press({ 50, 60 });

    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(DrawingCanvasViewTest, pressInAWindowThatIsNotKeyLeavesPopoverAndTool)
{
    platform::Window popover;
    popover.show();
    activate(popover);
    canvas->setPopoverWindow(&popover);
    canvas->setCurrentSelectedTool(QStringLiteral("color"));
    ASSERT_FALSE(contentOf(window).isKeyWindow());

    press({ 50, 60 });

    EXPECT_TRUE(popover.isVisible());
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("color"));
    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(DrawingCanvasViewTest, popoverThatIsGoneChangesNothing)
{
    {
        platform::Window popover;
        canvas->setPopoverWindow(&popover);
    }
    activate(window);
    canvas->setCurrentSelectedTool(QStringLiteral("color"));

    press({ 50, 60 });

    EXPECT_EQ(canvas->popoverWindow(), nullptr);
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("color"));
}

} // namespace
} // namespace penwick::test
