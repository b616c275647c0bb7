// SPDX-License-Identifier: MIT
#include "canvas/DrawViewController.h"

#include "appearance/Theme.h"
#include "appearance/ToolCursors.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/NotificationNames.h"
#include "history/UndoRedoManager.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/StandardOutput.h"
#include "platform/view/ViewHost.h"
#include "textbox/TnTextBox.h"

#include <penwick/platform/Window.h>

#include <QLocale>

#include <cmath>

namespace penwick {

namespace {

using platform::NotificationCenter;
using platform::Point;
using platform::Rect;
using platform::require;

std::optional<double> numberFrom(const QString &text)
{
    bool isNumber = false;
    QLocale locale;
    locale.setNumberOptions(QLocale::RejectGroupSeparator);
    const double value = locale.toDouble(text, &isNumber);
    return isNumber && std::isfinite(value) ? std::optional(value) : std::nullopt;
}

} // namespace

DrawViewController::DrawViewController()
{
    setObjectName(QStringLiteral("drawViewController"));
}

DrawViewController::~DrawViewController()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

void DrawViewController::setDrawingView(DrawingCanvasView *view)
{
    m_drawingView = view;
}

void DrawViewController::setDrawingCanvasModel(std::shared_ptr<DrawingCanvasModel> model)
{
    m_drawingCanvasModel = std::move(model);
}

const std::shared_ptr<DrawingCanvasModel> &DrawViewController::drawingCanvasModel() const
{
    return m_drawingCanvasModel;
}

DrawingCanvasView *DrawViewController::drawingView() const
{
    return m_drawingView;
}

DrawingCanvasView &DrawViewController::canvas() const
{
    return *require(m_drawingView.data(), "the draw view controller has no canvas");
}

DrawingCanvasModel &DrawViewController::model() const
{
    return *require(m_drawingCanvasModel.get(), "the draw view controller has no model");
}

UndoRedoManager &DrawViewController::history() const
{
    return *require(model().undoRedoManager().get(), "the canvas model has no history");
}

platform::Window *DrawViewController::drawingWindow() const
{
    return m_drawingWindow;
}

void DrawViewController::setDrawingWindow(platform::Window *window)
{
    m_drawingWindow = window;
}

void DrawViewController::configureAnnotatingImageView(const QImage &image)
{
    platform::ImageView &view
        = *require(m_annotatedImageView.data(), "the draw view controller has no image view");
    const QSizeF size = image.deviceIndependentSize();
    view.setFrame({ 0.0, 0.0, size.width(), size.height() });
    view.setImage(image);
}

void DrawViewController::viewDidLoad()
{
    NotificationCenter &center = NotificationCenter::defaultCenter();
    center.addObserver(this, drawingViewUpdatedNotification(),
        [this](const auto &) { updateDrawingCanvasViewForDisplay(); });
    center.addObserver(this, drawingCanvasSubviewUpdateNotification(),
        [this](const auto &notification) { handlDrawingCanvasSubviewOperation(notification); });

    const platform::Cursor cursor = getCursorOfType(QStringLiteral("Brush_Cursor"));
    canvas().setDrawingCanvasDelegate(this);
    setCursor(cursor);

    const auto model = std::make_shared<DrawingCanvasModel>();
    const auto history = std::make_shared<UndoRedoManager>();
    history->setDrawingCanvasModel(model);
    model->setUndoRedoManager(history);
    m_drawingCanvasModel = model;
    ViewController::viewDidLoad();
}

void DrawViewController::updateDrawingCanvasElements()
{
    canvas().setPathArray(model().pathArray());
    canvas().setTextBoxArray(model().textBoxArray());
}

void DrawViewController::updateDrawingCanvasViewForDisplay()
{
    updateDrawingCanvasElements();
    canvas().setNeedsDisplay();
}

void DrawViewController::didBeginDrawing(Point currentPoint)
{
    const auto &strokes = model().pathArray();
    if (strokes.isEmpty() || !strokes.last().bPathParams.startPoint)
        platform::fatalError("there is no stroke to extend");
    const Point previous = *strokes.last().bPathParams.startPoint;
    model().updateTheCurrentPath(currentPoint);
    drawPathOnCanvas(currentPoint, previous);
}

void DrawViewController::drawPathOnCanvas(Point pointToDraw, Point lastPoint)
{
    updateDrawingCanvasElements();
    const auto &strokes = canvas().pathArray();
    if (strokes.isEmpty())
        platform::fatalError("the canvas has no stroke to show");
    canvas().setNeedsDisplay(
        Rect::spanning(lastPoint, pointToDraw).grownBy(strokes.last().bPath->lineWidth()));
}

void DrawViewController::createTextBoxOnCanvas(Point)
{
    updateDrawingCanvasElements();
    const auto &boxes = canvas().textBoxArray();
    if (boxes.isEmpty())
        platform::fatalError("the canvas has no text box to show");
    // The whole box is marked, not the clicked point: the box lies below that point.
    canvas().setNeedsDisplay(boxes.last().textBox->frame());
}

void DrawViewController::didClearCanvas()
{
    canvas().setSubviews({});
    model().clearCanvas();
    updateDrawingCanvasViewForDisplay();
}

void DrawViewController::shouldDeleteTheTextBox(std::int64_t withHash)
{
    model().deleteTextBoxWith(withHash);
    if (platform::ViewHost *const window = canvas().window())
        window->makeFirstResponder(window->contentView());
    updateDrawingCanvasViewForDisplay();
}

void DrawViewController::handlDrawingCanvasSubviewOperation(
    const platform::Notification &notifiction)
{
    const auto operation = SubviewOperation::fromVariant(notifiction.object);
    if (!operation)
        platform::fatalError("a subview notification carries no subview operation");
    removeSubviews(*operation);
}

void DrawViewController::removeSubviews(const SubviewOperation &operation)
{
    const std::vector<platform::View *> subviews = canvas().subviews();
    if (subviews.empty())
        return;
    switch (operation.operation) {
    case SubviewOperation::Case::removeWithId:
        for (platform::View *const view : subviews) {
            if (dynamic_cast<TnTextBox *>(view) && view->hash() == operation.identifier) {
                view->removeFromSuperview();
                return;
            }
        }
        return;
    case SubviewOperation::Case::removefirst:
        subviews.front()->removeFromSuperview();
        return;
    case SubviewOperation::Case::removelast:
        subviews.back()->removeFromSuperview();
        return;
    case SubviewOperation::Case::removeall:
        canvas().setSubviews({});
        return;
    }
}

void DrawViewController::handleToolSelection(const QString &selectedTool)
{
    DrawingCanvasView &view = canvas();
    view.setCurrentSelectedTool(selectedTool);
    const auto goBackToDrawing = [&view] { view.setCurrentSelectedTool(view.lastSelecedTool()); };

    if (selectedTool == Tools::color) {
        goBackToDrawing(); // the colour itself is chosen in a popover
    } else if (selectedTool == Tools::text) {
        if (platform::ViewHost *const window = view.window())
            window->makeFirstResponder(&view);
        selectDrawingTool(selectedTool, QStringLiteral("Text_Cursor"));
    } else if (selectedTool == Tools::brush) {
        selectDrawingTool(selectedTool, QStringLiteral("Brush_Cursor"));
    } else if (selectedTool == Tools::eraser) {
        selectDrawingTool(selectedTool, QStringLiteral("Eraser_Cursor"));
    } else if (selectedTool == Tools::clear) {
        clearIfThereIsAnything();
        goBackToDrawing();
    } else if (selectedTool == Tools::state) {
        require(qobject_cast<platform::Window *>(view.widget().window()),
            "the canvas to be ended is in no window")
            ->close();
    } else if (selectedTool == Tools::undo) {
        history().undoAction();
        goBackToDrawing();
    } else if (selectedTool == Tools::redo) {
        history().redoAction();
        goBackToDrawing();
    } else {
        platform::printLine("Selected tool Not Available");
    }
}

void DrawViewController::selectDrawingTool(const QString &tool, const QString &cursor)
{
    canvas().setLastSelecedTool(tool);
    setCursor(getCursorOfType(cursor));
}

void DrawViewController::setCursor(const platform::Cursor &cursor)
{
    canvas().setCursorType(cursor);
    if (canvas().window())
        canvas().refreshCursorRects();
}

void DrawViewController::clearIfThereIsAnything()
{
    const DrawingCanvasView &view = canvas();
    if (!view.pathArray().isEmpty() || !view.textBoxArray().isEmpty() || !view.subviews().empty())
        didClearCanvas();
}

void DrawViewController::handleToolOptionSelection(const QString &selectedToolOption)
{
    const QStringList parts = selectedToolOption.split(QLatin1Char('#'));
    if (parts.size() != 2) {
        platform::printLine(
            "Selected tool Option: " + selectedToolOption.toStdString() + " is not available!");
        return;
    }
    DrawingCanvasView &view = canvas();
    const QString &tool = parts[0];
    const QString &value = parts[1];
    if (tool == Tools::color) {
        const auto color = colorMap().constFind(value);
        if (color != colorMap().constEnd())
            view.setBrushColor(*color);
        view.setCurrentSelectedTool(view.lastSelecedTool());
    } else if (tool == Tools::brush) {
        if (const auto thickness = numberFrom(value))
            view.setBrushThickness(*thickness);
    } else if (tool == Tools::text) {
        if (const auto size = numberFrom(value))
            view.setTextFontSize(*size);
    }
}

} // namespace penwick
