// SPDX-License-Identifier: MIT
#include "Board.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/foundation/FatalError.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

#include <QCoreApplication>
#include <QGuiApplication>
#include <QMouseEvent>

namespace penwick::bench {

namespace {

using platform::Point;

void send(QWidget &widget, QEvent::Type type, Qt::MouseButton button, Point point)
{
    const QPointF position(point.x, widget.height() - point.y);
    QMouseEvent event(
        type, position, widget.mapToGlobal(position), button, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&widget, &event);
}

} // namespace

void sendPress(QWidget &widget, Point point)
{
    send(widget, QEvent::MouseButtonPress, Qt::LeftButton, point);
}

void sendDrag(QWidget &widget, Point point)
{
    send(widget, QEvent::MouseMove, Qt::NoButton, point);
}

void paintMarked()
{
    QCoreApplication::sendPostedEvents();
}

void settle()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

Board::Board(int strokes)
    : m_window(m_penwick.createDrawingWindowController(
        WindowType::whiteboard, QGuiApplication::primaryScreen()))
{
    platform::Window &window = *platform::require(m_window->drawingWindow(), "no window opened");
    m_controller = platform::require(
        dynamic_cast<DrawViewController *>(contentOf(window).contentViewController()),
        "no draw controller");
    m_canvas = platform::require(m_controller->drawingView(), "the board has no canvas");
    m_window->showWindow(nullptr);
    settle();
    resize(canvasWidth, canvasHeight);
    settle();
    contentOf(window).makeFirstResponder(m_canvas);
    Pen pen(7);
    scribble(pen, strokes);
}

Board::~Board()
{
    m_window.reset();
    settle();
}

void Board::choose(const QString &tool)
{
    m_controller->handleToolSelection(tool);
}

void Board::takePointer()
{
    m_canvas->cursorType().set(*m_canvas);
}

void Board::press(Point point)
{
    sendPress(*m_canvas, point);
}

void Board::drag(Point point)
{
    sendDrag(*m_canvas, point);
}

void Board::draw(Pen &pen)
{
    choose(QStringLiteral("brush"));
    press(pen.putDown());
    for (int segment = 0; segment < segmentsOfAStroke; ++segment)
        drag(pen.next());
    settle();
}

void Board::scribble(Pen &pen, int strokes, int segments)
{
    bench::scribble(model(), pen, strokes, segments);
    m_controller->updateDrawingCanvasViewForDisplay();
    settle();
}

void Board::expose()
{
    m_canvas->setNeedsDisplay();
}

void Board::resize(int width, int height)
{
    m_window->drawingWindow()->resize(width, height);
}

DrawingCanvasModel &Board::model() const
{
    return *m_controller->drawingCanvasModel();
}

const EntryList<StrokeEntry> &Board::strokes() const
{
    return model().pathArray();
}

double Board::scale() const
{
    return m_canvas->devicePixelRatioF();
}

} // namespace penwick::bench
