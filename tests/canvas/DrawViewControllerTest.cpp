// SPDX-License-Identifier: MIT
// Tools, as they reach a canvas, and what is copied and painted for them.
#include "canvas/AddedObservers.h"
#include "canvas/CanvasFixture.h"

#include "history/NotificationNames.h"
#include "platform/view/ImageView.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/NotificationCenter.h>

namespace penwick::test {
namespace {

constexpr QRect wholeCanvas { 0, 0, 300, 200 };

const QString brush = QStringLiteral("brush");
const QString eraser = QStringLiteral("eraser");
const QString text = QStringLiteral("text");
const QString clear = QStringLiteral("clear");
const QString undo = QStringLiteral("undo");
const QString redo = QStringLiteral("redo");

using DrawViewControllerTest = CanvasFixture;

// Set-up

TEST_F(DrawViewControllerTest, loadedControllerHasAnEmptyModelWithItsHistoryAndTheBrushsCursor)
{
    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_TRUE(model().textBoxArray().isEmpty());
    EXPECT_TRUE(history().undoStack().isEmpty());
    EXPECT_TRUE(history().redoStack().isEmpty());
    EXPECT_EQ(history().undoCount(), 0);
    EXPECT_EQ(canvas->drawingCanvasDelegate(), controller);
    EXPECT_EQ(canvas->cursorType().hotSpot(), (Point { 0, 20 }));
    EXPECT_EQ(canvas->cursor().hotSpot(), QPoint(0, 20));
    EXPECT_EQ(
        canvas->cursor().pixmap().toImage(), canvas->cursorType().forScale(1.0).pixmap().toImage());
    EXPECT_EQ(contentOf(window).contentView(), canvas);
    EXPECT_EQ(contentOf(window).contentViewController(), controller);
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawViewControllerTest, redrawingIsObservedBeforeSubviewOperationsAre)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });
    const auto other = std::make_unique<DrawViewController>();
    other->setDrawingView(&alone);
    const qsizetype before = namesObservedBy(other.get()).size(); // by one that had its place

    other->setView(alone);

    EXPECT_EQ(namesObservedBy(other.get()).mid(before),
        (QStringList {
            drawingViewUpdatedNotification(), drawingCanvasSubviewUpdateNotification() }));
}

TEST_F(DrawViewControllerTest, outletsAreWeak)
{
    auto other = std::make_unique<DrawingCanvasView>();
    DrawViewController alone;
    alone.setDrawingView(other.get());
    EXPECT_EQ(alone.drawingView(), other.get());

    other.reset();

    EXPECT_EQ(alone.drawingView(), nullptr);
}

TEST_F(DrawViewControllerTest, drawingWindowIsKeptForWhoeverSetsItAndNoLongerThanItLives)
{
    auto other = std::make_unique<platform::Window>();
    EXPECT_EQ(controller->drawingWindow(), nullptr);

    controller->setDrawingWindow(other.get());
    EXPECT_EQ(controller->drawingWindow(), other.get());

    other.reset();
    EXPECT_EQ(controller->drawingWindow(), nullptr);
}

TEST_F(DrawViewControllerTest, canvasOutsideAWindowIsLoadedToo)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });
    DrawViewController other;
    other.setDrawingView(&alone);

    other.setView(alone);

    EXPECT_EQ(alone.drawingCanvasDelegate(), &other);
    EXPECT_EQ(alone.cursorType().hotSpot(), (Point { 0, 20 }));
    other.handleToolSelection(text);
    EXPECT_EQ(alone.cursorType().hotSpot(), (Point { 10, 10 }));
    EXPECT_EQ(alone.lastSelecedTool(), text);
}

TEST_F(DrawViewControllerTest, controllerThatIsGoneObservesNothing)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });
    {
        DrawViewController shortLived;
        shortLived.setDrawingView(&alone);
        shortLived.setView(alone);
    }
    alone.addSubview(platform::makeView<PlainView>());

    post(drawingViewUpdatedNotification());
    postSubviewOperation({ SubviewOperation::Case::removeall, 0 });

    EXPECT_EQ(alone.subviews().size(), 1U);
    EXPECT_EQ(alone.drawingCanvasDelegate(), nullptr);
}

TEST_F(DrawViewControllerTest, annotatedImageIsShownInItsView)
{
    platform::ImageView imageView;
    controller->setAnnotatedImageView(&imageView);
    QImage image(3, 4, QImage::Format_RGB32);
    image.fill(Qt::green);

    controller->configureAnnotatingImageView(image);

    EXPECT_EQ(imageView.image(), image);
    EXPECT_EQ(imageView.frame(), (Rect { 0, 0, 3, 4 }));
}

TEST_F(DrawViewControllerTest, clearNeverTouchesTheAnnotatedImage)
{
    platform::ImageView imageView;
    controller->setAnnotatedImageView(&imageView);
    QImage image(3, 4, QImage::Format_RGB32);
    image.fill(Qt::green);
    controller->configureAnnotatingImageView(image);
    stroke({ { 10, 10 }, { 50, 50 } });

    controller->handleToolSelection(QStringLiteral("clear"));

    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(imageView.image(), image);
    EXPECT_EQ(imageView.frame(), (Rect { 0, 0, 3, 4 }));
}

// What is copied and painted

TEST_F(DrawViewControllerTest, updatingElementsCopiesBothArraysAndPaintsNothing)
{
    model().createPathWithParam(Qt::black, 5.0, { 10, 10 });
    model().createTextBox({ 50, 60 }, Qt::black, 24.0, controller);
    PaintRecorder painted(*canvas);

    controller->updateDrawingCanvasElements();

    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    EXPECT_EQ(idsOf(canvas->textBoxArray()), idsOf(model().textBoxArray()));
    EXPECT_EQ(canvas->pathArray().last().bPath, model().pathArray().last().bPath);
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect>());
}

TEST_F(DrawViewControllerTest, updatedDrawingIsCopiedAndPaintedWhole)
{
    model().createPathWithParam(Qt::black, 5.0, { 10, 10 });
    PaintRecorder painted(*canvas);

    post(drawingViewUpdatedNotification());

    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    EXPECT_EQ(paintedAfterNow(painted), std::vector<QRect> { wholeCanvas });
}

TEST_F(DrawViewControllerTest, drawnPointExtendsTheNewestStrokeAndMarksTheSegmentsBox)
{
    model().createPathWithParam(Qt::black, 5.0, { 10, 10 });
    model().createPathWithParam(Qt::black, 12.0, { 100, 100 });
    PaintRecorder painted(*canvas);

    controller->didBeginDrawing({ 80, 130 });

    EXPECT_EQ(model().pathArray()[0].bPath->elementCount(), 0);
    EXPECT_EQ(model().pathArray()[1].bPath->elementCount(), 2);
    EXPECT_EQ(model().pathArray()[1].bPathParams.startPoint, (Point { 80, 130 }));
    EXPECT_EQ(canvas->pathArray().last().bPathParams.startPoint, (Point { 80, 130 }));
    EXPECT_EQ(paintedAfterNow(painted), (std::vector<QRect> { { 68, 200 - 142, 44, 54 } }));
}

TEST_F(DrawViewControllerTest, pathDrawnOnTheCanvasMarksTheBoxGrownByTheNewestStrokesWidth)
{
    model().createPathWithParam(Qt::black, 3.0, { 10, 10 });
    PaintRecorder painted(*canvas);

    controller->drawPathOnCanvas({ 40, 20 }, { 60, 50 });

    EXPECT_EQ(idsOf(canvas->pathArray()), idsOf(model().pathArray()));
    EXPECT_EQ(paintedAfterNow(painted), (std::vector<QRect> { { 37, 200 - 53, 26, 36 } }));
}

// Tools

TEST_F(DrawViewControllerTest, drawingToolsBecomeCurrentAndLastAndBringTheirCursor)
{
    const std::pair<QString, Point> tools[]
        = { { text, { 10, 10 } }, { eraser, { 0, 20 } }, { brush, { 0, 20 } } };
    for (const auto &[tool, hotSpot] : tools) {
        const platform::Cursor before = canvas->cursorType();

        EXPECT_EQ(printedBy(tool), "");

        EXPECT_EQ(canvas->currentSelectedTool(), tool);
        EXPECT_EQ(canvas->lastSelecedTool(), tool);
        EXPECT_FALSE(canvas->cursorType() == before) << tool.toStdString();
        EXPECT_EQ(canvas->cursorType().hotSpot(), hotSpot) << tool.toStdString();
        EXPECT_EQ(canvas->cursor().pixmap().toImage(),
            canvas->cursorType().forScale(1.0).pixmap().toImage())
            << tool.toStdString();
    }
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawViewControllerTest, onlyTheTextToolTakesTheFirstResponder)
{
    for (const QString &tool : { brush, eraser, undo, redo, clear }) {
        contentOf(window).makeFirstResponder(nullptr);
        controller->handleToolSelection(tool);
        EXPECT_EQ(contentOf(window).firstResponder(), nullptr) << tool.toStdString();
    }

    controller->handleToolSelection(text);

    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
}

TEST_F(DrawViewControllerTest, firstClickAfterChoosingTheTextToolMakesABox)
{
    controller->handleToolSelection(text);

    click({ 60, 100 });

    EXPECT_EQ(model().textBoxArray().size(), 1);
}

TEST_F(DrawViewControllerTest, colourNeverStaysTheToolSoTheBrushWorksAtOnce)
{
    EXPECT_EQ(printedBy(QStringLiteral("color")), "");
    EXPECT_EQ(canvas->currentSelectedTool(), brush);
    press({ 50, 60 });
    EXPECT_EQ(model().pathArray().size(), 1);

    controller->handleToolSelection(eraser);
    controller->handleToolSelection(QStringLiteral("color"));
    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
    EXPECT_EQ(canvas->lastSelecedTool(), eraser);
}

TEST_F(DrawViewControllerTest, unknownToolIsPrintedAndDrawsNothingUntilAKnownOneIsChosen)
{
    for (const char *const tool : { "laser", "Brush", "brush ", "" }) {
        EXPECT_EQ(printedBy(QString::fromLatin1(tool)), "Selected tool Not Available\n");
        EXPECT_EQ(canvas->currentSelectedTool(), QString::fromLatin1(tool));
        EXPECT_EQ(canvas->lastSelecedTool(), brush);
        press({ 50, 60 });
        drag({ 60, 60 });
        release({ 60, 60 });
    }
    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(recorder.take(), Posts());

    controller->handleToolSelection(brush);
    stroke({ { 50, 60 }, { 60, 60 } });
    EXPECT_EQ(model().pathArray().size(), 1);
}

TEST_F(DrawViewControllerTest, momentaryToolAfterAnUnknownOneGoesBackToTheLastDrawingTool)
{
    controller->handleToolSelection(eraser);
    static_cast<void>(printedBy(QStringLiteral("laser")));

    controller->handleToolSelection(undo);

    EXPECT_EQ(canvas->currentSelectedTool(), eraser);
}

TEST_F(DrawViewControllerTest, stateClosesTheWindowOnceAndLeavesEverythingElse)
{
    class Delegate final : public QObject, public platform::WindowDelegate
    {
    public:
        void windowWillClose() override { ++closed; }
        int closed = 0;
    };
    Delegate delegate;
    window.setDelegate(&delegate);
    stroke({ { 10, 10 }, { 20, 20 } });
    static_cast<void>(recorder.take());

    EXPECT_EQ(printedBy(QStringLiteral("state")), "");

    EXPECT_FALSE(window.isVisible());
    EXPECT_EQ(delegate.closed, 1);
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("state"));
    EXPECT_EQ(model().pathArray().size(), 1);
    EXPECT_EQ(recorder.take(), Posts());
}

} // namespace
} // namespace penwick::test
