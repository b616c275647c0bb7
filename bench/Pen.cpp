// SPDX-License-Identifier: MIT
#include "Pen.h"

#include "canvas/DrawingCanvasModel.h"

#include <QColor>

#include <algorithm>
#include <cmath>
#include <iterator>

namespace penwick::bench {

namespace {

using platform::Point;

constexpr double thickness = 5.0;
constexpr double gap = 80.0; // between free places, along each axis
constexpr double freeRadius = 9.0; // a step across it keeps half a thickness from its centre

bool isFree(Point point)
{
    const auto away
        = [](double coordinate) { return coordinate - (std::floor(coordinate / gap) + 0.5) * gap; };
    return std::hypot(away(point.x), away(point.y)) < freeRadius;
}

} // namespace

Pen::Pen(unsigned seed, double longestStep)
    : m_random(seed)
    , m_longestStep(longestStep)
{ }

double Pen::anyUpTo(double most)
{
    return std::uniform_real_distribution<double>(0.0, most)(m_random);
}

Point Pen::putDown()
{
    do {
        m_point = { anyUpTo(canvasWidth), anyUpTo(canvasHeight) };
    } while (isFree(m_point));
    return m_point;
}

Point Pen::next()
{
    const Point from = m_point;
    const auto step = [this] { return anyUpTo(2 * m_longestStep) - m_longestStep; };
    do {
        const double x = from.x + step();
        const double y = from.y + step();
        m_point
            = { std::clamp(x, 0.0, double(canvasWidth)), std::clamp(y, 0.0, double(canvasHeight)) };
    } while (isFree(m_point));
    return m_point;
}

std::vector<Point> freePlaces()
{
    std::vector<Point> places;
    const auto middle = [](int index) { return (index + 0.5) * gap; };
    for (int column = 0; middle(column) < canvasWidth; ++column) {
        for (int row = 0; middle(row) < canvasHeight; ++row)
            places.push_back({ middle(column), middle(row) });
    }
    return places;
}

Point around(Point freePlace, int number)
{
    constexpr double radius = 5.0;
    constexpr Point steps[] { { radius, 0.0 }, { 0.0, radius }, { -radius, 0.0 },
        { 0.0, -radius } };
    return freePlace + steps[static_cast<std::size_t>(number) % std::size(steps)];
}

void scribble(DrawingCanvasModel &model, Pen &pen, int strokes, int segments)
{
    const QColor color(41, 41, 41, 178);
    for (int stroke = 0; stroke < strokes; ++stroke) {
        model.createPathWithParam(color, thickness, pen.putDown());
        for (int segment = 0; segment < segments; ++segment)
            model.updateTheCurrentPath(pen.next());
    }
}

} // namespace penwick::bench
