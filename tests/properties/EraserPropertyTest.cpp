// SPDX-License-Identifier: MIT
// A fast eraser against a slow one: what one drag takes on its way is what a drag every hundredth
// of a point takes, in that order.
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/UndoRedoManager.h"

#include "appearance/PenwickBundle.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>
#include <optional>
#include <vector>

namespace penwick::test {
namespace {

using platform::Point;

constexpr double side = 200.0; // points
constexpr double step = 0.01; // points, of the slow eraser
constexpr double hardly = 0.02; // points; what is nearer than this to an edge is not asked

Point anyPlace()
{
    const auto coordinate = [] { return *rc::gen::inRange(0, 1'000'000) * (side / 1e6); };
    const double x = coordinate();
    return { x, coordinate() };
}

/// A stroke as a list of places and nothing else.
struct PlainStroke
{
    double radius = 0.0;
    std::vector<Point> places;

    [[nodiscard]] double distance(Point from) const
    {
        double least = std::numeric_limits<double>::infinity();
        for (std::size_t place = 1; place < places.size(); ++place) {
            const Point a = places[place - 1];
            const Point along = places[place] - a;
            const Point away = from - a;
            const double square = along.x * along.x + along.y * along.y;
            const double part = square == 0.0
                ? 0.0
                : std::clamp((away.x * along.x + away.y * along.y) / square, 0.0, 1.0);
            least = std::min(least, std::hypot(away.x - part * along.x, away.y - part * along.y));
        }
        return least;
    }
};

std::vector<PlainStroke> anyDrawing()
{
    std::vector<PlainStroke> drawing(*rc::gen::inRange<std::size_t>(1, 12));
    for (PlainStroke &stroke : drawing) {
        stroke.radius = *rc::gen::element(1.5, 2.5, 6.0, 15.0);
        for (int places = *rc::gen::inRange(1, 6); places > 0; --places)
            stroke.places.push_back(anyPlace());
    }
    return drawing;
}

/// What a slow eraser takes from `from` to `to`, by number, and at which of its events.
struct Slow
{
    std::vector<int> taken;
    std::vector<int> events;
    bool isClear = true; // the answer is certain: no stroke is grazed, or met right at an end
};

Slow erasedSlowly(const std::vector<PlainStroke> &drawing, Point from, Point to)
{
    const double length = std::hypot(to.x - from.x, to.y - from.y);
    const int events = std::max(1, static_cast<int>(length / step));
    Slow slow;
    std::vector<bool> isGone(drawing.size());
    std::vector<double> nearest(drawing.size(), std::numeric_limits<double>::infinity());
    for (int event = 1; event <= events; ++event) {
        const double part = static_cast<double>(event) / events;
        const Point place { from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part };
        bool hasTaken = false; // one at each event, the oldest
        for (std::size_t number = 0; number < drawing.size(); ++number) {
            const double away = drawing[number].distance(place) - drawing[number].radius;
            nearest[number] = std::min(nearest[number], away);
            if ((event == 1 || event == events) && std::abs(away) < hardly)
                slow.isClear = false;
            if (away > 0.0 || isGone[number] || hasTaken)
                continue;
            isGone[number] = hasTaken = true;
            slow.taken.push_back(static_cast<int>(number));
            slow.events.push_back(event);
        }
    }
    for (const double away : nearest)
        slow.isClear = slow.isClear && std::abs(away) > 1e-4;
    return slow;
}

/// A canvas with a drawing on it, and the eraser in hand.
class Board
{
public:
    explicit Board(const std::vector<PlainStroke> &drawing)
        : m_canvas(*new DrawingCanvasView(&m_window))
    {
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        m_window.resize(static_cast<int>(side), static_cast<int>(side));
        contentOf(m_window).adoptScene();
        contentOf(m_window).setContentView(&m_canvas);
        m_controller.setDrawingView(&m_canvas);
        m_controller.setView(m_canvas);
        for (const PlainStroke &stroke : drawing) {
            model().createPathWithParam(Qt::black, 2 * stroke.radius, stroke.places.front());
            for (std::size_t place = 1; place < stroke.places.size(); ++place)
                model().updateTheCurrentPath(stroke.places[place]);
            m_numbers.push_back(model().pathArray().last().pathId);
        }
        m_canvas.setCurrentSelectedTool(QStringLiteral("eraser"));
    }

    /// The numbers of the strokes that one drag takes.
    std::vector<int> erased(Point from, Point to)
    {
        m_canvas.mouseDown({ from, 1 });
        m_canvas.mouseDragged({ to, 1 });
        std::vector<int> numbers;
        for (const UndoRedoState &record : model().undoRedoManager()->undoStack()) {
            if (record.actionAssociated != ActionType::erase)
                continue;
            const auto found = std::ranges::find(m_numbers, record.elementId);
            numbers.push_back(static_cast<int>(found - m_numbers.begin()));
        }
        return numbers;
    }

private:
    [[nodiscard]] DrawingCanvasModel &model() const { return *m_controller.drawingCanvasModel(); }

    platform::Window m_window;
    DrawingCanvasView &m_canvas; // the window's
    DrawViewController m_controller;
    std::vector<std::int64_t> m_numbers;
};

RC_GTEST_PROP(FastEraser, takesWhatASlowOneTakesInThatOrder, ())
{
    const std::vector<PlainStroke> drawing = anyDrawing();
    const Point from = anyPlace();
    const Point to = anyPlace();
    const Slow slow = erasedSlowly(drawing, from, to);
    RC_PRE(slow.isClear);

    const std::vector<int> fast = Board(drawing).erased(from, to);

    RC_ASSERT(fast.size() == slow.taken.size());
    // The order need not be the same for strokes that a slow eraser meets within a few events: it
    // takes only one at each event.
    for (std::size_t place = 0; place < fast.size(); ++place) {
        const auto found = std::ranges::find(slow.taken, fast[place]);
        RC_ASSERT(found != slow.taken.end());
        const auto slowPlace = static_cast<std::size_t>(found - slow.taken.begin());
        const int tolerance = static_cast<int>(fast.size());
        RC_ASSERT(std::abs(slow.events[slowPlace] - slow.events[place]) <= tolerance);
    }
}

} // namespace
} // namespace penwick::test
