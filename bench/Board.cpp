// SPDX-License-Identifier: MIT
#include "Board.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "strokes/StrokeHitTest.h"
#include "history/UndoRedoManager.h"

#include <QCoreApplication>
#include <QMouseEvent>

#include <algorithm>

namespace penwick::bench {

namespace {

using platform::Point;

constexpr double width = 1280.0;
constexpr double height = 720.0;
constexpr double thickness = 5.0;
constexpr double longestStep = 4.0; // of a pointer that writes, along each axis
constexpr std::size_t placesWanted = 64;

double anyUpTo(std::mt19937 &random, double most)
{
    return std::uniform_real_distribution<double>(0.0, most)(random);
}

Point pointAfter(std::mt19937 &random, Point point)
{
    const auto step = [&random] { return anyUpTo(random, 2 * longestStep) - longestStep; };
    return { std::clamp(point.x + step(), 0.0, width), std::clamp(point.y + step(), 0.0, height) };
}

} // namespace

void scribble(DrawingCanvasModel &model, int strokes)
{
    std::mt19937 random(7);
    const QColor color(41, 41, 41, 178);
    for (int stroke = 0; stroke < strokes; ++stroke) {
        Point point { anyUpTo(random, width), anyUpTo(random, height) };
        model.createPathWithParam(color, thickness, point);
        for (int segment = 0; segment < segmentsOfAStroke; ++segment) {
            point = pointAfter(random, point);
            model.updateTheCurrentPath(point);
        }
    }
}

Board::Board(int strokes)
    : m_notShown(std::make_unique<DrawingCanvasView>())
{
    m_canvas = new DrawingCanvasView(&m_window);
    m_window.adoptScene();
    auto content = std::make_unique<DrawViewController>();
    m_controller = content.get();
    content->setDrawingView(m_canvas);
    content->setView(*m_canvas);
    m_window.setContentViewController(std::move(content));
    scribble(*m_controller->drawingCanvasModel(), strokes);
    m_controller->updateDrawingCanvasElements();

    m_window.show();
    m_window.resize(static_cast<int>(width), static_cast<int>(height));
    m_window.makeFirstResponder(m_canvas);
    QCoreApplication::processEvents();
    show();
}

Board::~Board() = default;

void Board::choose(const QString &tool)
{
    m_controller->handleToolSelection(tool);
}

void Board::press(Point point)
{
    send(QEvent::MouseButtonPress, point);
}

void Board::drag(Point point)
{
    send(QEvent::MouseMove, point);
}

void Board::show()
{
    QCoreApplication::sendPostedEvents();
}

void Board::forgetNewestStroke()
{
    m_controller->setDrawingView(m_notShown.get());
    m_controller->drawingCanvasModel()->undoRedoManager()->undoAction();
    m_controller->setDrawingView(m_canvas);
    m_controller->updateDrawingCanvasElements();
}

Point Board::nextPoint()
{
    m_point = pointAfter(m_random, m_point);
    return m_point;
}

std::vector<Point> Board::emptyPlaces() const
{
    std::mt19937 random(11);
    const auto &strokes = m_controller->drawingCanvasModel()->pathArray();
    std::vector<Point> places;
    while (places.size() < placesWanted) {
        const Point point { anyUpTo(random, width), anyUpTo(random, height) };
        const auto hit = strokes.firstIndexWhere(
            [point](const StrokeEntry &entry) { return strokeContains(*entry.bPath, point); });
        if (!hit)
            places.push_back(point);
    }
    return places;
}

void Board::send(QEvent::Type type, Point point)
{
    const QPointF position(point.x, m_canvas->QWidget::height() - point.y);
    const bool isPress = type == QEvent::MouseButtonPress;
    QMouseEvent event(type, position, m_canvas->mapToGlobal(position),
        isPress ? Qt::LeftButton : Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_canvas, &event);
}

} // namespace penwick::bench
