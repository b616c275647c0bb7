// SPDX-License-Identifier: MIT
// What stops the process when a controller is used.
#include "canvas/CanvasFixture.h"

#include "history/NotificationNames.h"

#include <functional>
#include <ostream>

namespace penwick::test {
namespace {

using Case = SubviewOperation::Case;

const QString eraser = QStringLiteral("eraser");
const QString undo = QStringLiteral("undo");
const QString redo = QStringLiteral("redo");

using DrawViewControllerDeathTest = CanvasFixture;

/// One operation of a controller, by name.
struct Operation
{
    const char *name;
    std::function<void(DrawViewController &)> run;
};

std::ostream &operator<<(std::ostream &stream, const Operation &operation)
{
    return stream << operation.name;
}

std::string nameOf(const ::testing::TestParamInfo<Operation> &info)
{
    return info.param.name;
}

Operation choosing(const char *tool)
{
    return { tool, [name = QString::fromLatin1(tool)](DrawViewController &controller) {
                controller.handleToolSelection(name);
            } };
}

class NeedsACanvas : public ::testing::TestWithParam<Operation>
{ };

TEST_P(NeedsACanvas, elseItIsFatal)
{
    DrawViewController alone;
    alone.setDrawingCanvasModel(std::make_shared<DrawingCanvasModel>());

    EXPECT_DEATH(
        GetParam().run(alone), "penwick: fatal error: the draw view controller has no canvas\n");
}

INSTANTIATE_TEST_SUITE_P(DrawViewController, NeedsACanvas,
    ::testing::Values(choosing("brush"), choosing("clear"), choosing("state"), choosing("undo"),
        choosing("laser"),
        Operation { "option",
            [](DrawViewController &controller) {
                controller.handleToolOptionSelection(QStringLiteral("brush#7"));
            } },
        Operation { "load",
            [](DrawViewController &controller) {
                setPenwickBundle(
                    std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
                controller.viewDidLoad();
            } },
        Operation { "updateElements",
            [](DrawViewController &controller) { controller.updateDrawingCanvasElements(); } },
        Operation { "updateForDisplay",
            [](DrawViewController &controller) {
                controller.updateDrawingCanvasViewForDisplay();
            } },
        Operation { "drawPath",
            [](DrawViewController &controller) { controller.drawPathOnCanvas({}, {}); } },
        Operation { "createTextBox",
            [](DrawViewController &controller) { controller.createTextBoxOnCanvas({}); } },
        Operation {
            "clearCanvas", [](DrawViewController &controller) { controller.didClearCanvas(); } },
        Operation { "deleteTextBox",
            [](DrawViewController &controller) { controller.shouldDeleteTheTextBox(1); } },
        Operation { "removeSubviews",
            [](DrawViewController &controller) {
                controller.handlDrawingCanvasSubviewOperation(
                    { QString(), SubviewOperation { Case::removeall, 0 }.toVariant() });
            } }),
    nameOf);

class NeedsAModel : public ::testing::TestWithParam<Operation>
{ };

TEST_P(NeedsAModel, elseItIsFatal)
{
    DrawingCanvasView canvas(Rect { 0, 0, 100, 100 });
    DrawViewController alone;
    alone.setDrawingView(&canvas);

    EXPECT_DEATH(
        GetParam().run(alone), "penwick: fatal error: the draw view controller has no model\n");
}

INSTANTIATE_TEST_SUITE_P(DrawViewController, NeedsAModel,
    ::testing::Values(choosing("undo"), choosing("redo"),
        Operation { "beginDrawing",
            [](DrawViewController &controller) { controller.didBeginDrawing({}); } },
        Operation { "updateElements",
            [](DrawViewController &controller) { controller.updateDrawingCanvasElements(); } },
        Operation { "drawPath",
            [](DrawViewController &controller) { controller.drawPathOnCanvas({}, {}); } },
        Operation { "createTextBox",
            [](DrawViewController &controller) { controller.createTextBoxOnCanvas({}); } },
        Operation {
            "clearCanvas", [](DrawViewController &controller) { controller.didClearCanvas(); } },
        Operation { "deleteTextBox",
            [](DrawViewController &controller) { controller.shouldDeleteTheTextBox(1); } }),
    nameOf);

TEST_F(DrawViewControllerDeathTest, undoOrRedoWithoutAHistoryIsFatal)
{
    model().setUndoRedoManager(nullptr);

    EXPECT_DEATH(controller->handleToolSelection(undo),
        "penwick: fatal error: the canvas model has no history\n");
    EXPECT_DEATH(controller->handleToolSelection(redo),
        "penwick: fatal error: the canvas model has no history\n");
}

TEST_F(DrawViewControllerDeathTest, stateOutsideAWindowIsFatal)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });
    controller->setDrawingView(&alone);

    EXPECT_DEATH(controller->handleToolSelection(QStringLiteral("state")),
        "penwick: fatal error: the canvas to be ended is in no window\n");
}

TEST_F(DrawViewControllerDeathTest, drawingWithoutAStrokeIsFatal)
{
    EXPECT_DEATH(controller->didBeginDrawing({ 1, 1 }),
        "penwick: fatal error: there is no stroke to extend\n");
    EXPECT_DEATH(controller->drawPathOnCanvas({ 1, 1 }, { 2, 2 }),
        "penwick: fatal error: the canvas has no stroke to show\n");
}

TEST_F(DrawViewControllerDeathTest, drawingOnAStrokeWithoutAStartPointIsFatal)
{
    stroke({ { 10, 10 }, { 20, 20 } });
    StrokeEntry entry = model().pathArray().last();
    entry.bPathParams.startPoint.reset();
    history().pushUndo({ entry, ActionType::erase, entry.pathId });
    history().undoAction(); // now it is the newest

    EXPECT_DEATH(controller->didBeginDrawing({ 1, 1 }),
        "penwick: fatal error: there is no stroke to extend\n");
}

TEST_F(DrawViewControllerDeathTest, showingATextBoxThatIsNotThereIsFatal)
{
    EXPECT_DEATH(controller->createTextBoxOnCanvas({ 1, 1 }),
        "penwick: fatal error: the canvas has no text box to show\n");
}

TEST_F(DrawViewControllerDeathTest, loadWithoutTheBundleIsFatal)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });
    DrawViewController other;
    other.setDrawingView(&alone);
    setPenwickBundle(nullptr);

    EXPECT_DEATH(other.viewDidLoad(), "penwick: fatal error: the resource bundle is not set\n");
}

TEST_F(DrawViewControllerDeathTest, loadTakesTheCursorBeforeItAsksForTheCanvas)
{
    DrawViewController withoutACanvas;
    setPenwickBundle(nullptr);

    EXPECT_DEATH(
        withoutACanvas.viewDidLoad(), "penwick: fatal error: the resource bundle is not set\n");
}

TEST_F(DrawViewControllerDeathTest, toolWhoseCursorIsMissingIsFatal)
{
    setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/nowhere")));

    EXPECT_DEATH(controller->handleToolSelection(eraser),
        "penwick: fatal error: a cursor image is missing\n");
}

TEST_F(DrawViewControllerDeathTest, imageWithoutAnImageViewIsFatal)
{
    EXPECT_DEATH(controller->configureAnnotatingImageView(QImage()),
        "penwick: fatal error: the draw view controller has no image view\n");
}

TEST_F(DrawViewControllerDeathTest, subviewNotificationWithAnyOtherObjectIsFatal)
{
    const QVariant objects[]
        = { QVariant(), 7, QStringLiteral("removesecond"), QVariantMap(), QVariantList() };
    for (const QVariant &object : objects) {
        EXPECT_DEATH(post(drawingCanvasSubviewUpdateNotification(), object),
            "penwick: fatal error: a subview notification carries no subview operation\n")
            << object.typeName();
    }
}

} // namespace
} // namespace penwick::test
