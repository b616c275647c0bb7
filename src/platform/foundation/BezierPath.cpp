// SPDX-License-Identifier: MIT
#include <penwick/platform/BezierPath.h>

#include "platform/foundation/ObjectIdentifier.h"

#include <algorithm>
#include <utility>

namespace penwick::platform {

namespace {

std::size_t pointCount(BezierPath::ElementKind kind)
{
    switch (kind) {
    case BezierPath::ElementKind::MoveTo:
    case BezierPath::ElementKind::LineTo:
        return 1;
    case BezierPath::ElementKind::CurveTo:
        return 3;
    case BezierPath::ElementKind::ClosePath:
        return 0;
    }
    return 0;
}

QPointF toQt(Point point)
{
    return { point.x, point.y };
}

// A QPainterPath leaves out a line or curve that ends where it began, or very near. So its end is
// first put to this other place, and then moved to where it belongs.
QPointF farFrom(QPointF point)
{
    return { point.x() > 0.0 ? -1.0 : 1.0, point.y() };
}

void moveEnd(QPainterPath &path, Point end)
{
    path.setElementPositionAt(path.elementCount() - 1, end.x, end.y);
}

void addLine(QPainterPath &path, Point end)
{
    path.lineTo(farFrom(path.currentPosition()));
    moveEnd(path, end);
}

void addCurve(QPainterPath &path, const std::array<Point, 3> &points)
{
    path.cubicTo(toQt(points[0]), toQt(points[1]), farFrom(path.currentPosition()));
    moveEnd(path, points[2]);
}

} // namespace

BezierPath::BezierPath()
    : m_hash(nextObjectIdentifier())
{ }

BezierPath::Element BezierPath::elementAtIndex(int index) const
{
    const auto place = static_cast<std::size_t>(index);
    if (m_isChain) {
        const bool isMove = place % 2 == 0;
        return { isMove ? ElementKind::MoveTo : ElementKind::LineTo,
            { m_points.at((place + 1) / 2), {}, {} } };
    }
    const Step step = m_steps.at(place);
    Element element { step.kind, {} };
    std::copy_n(m_points.begin() + step.firstPoint, pointCount(step.kind), element.points.begin());
    return element;
}

std::span<const Point> BezierPath::chain() const
{
    return m_isChain ? std::span(m_points) : std::span<const Point>();
}

bool BezierPath::continuesChain(ElementKind kind, std::span<const Point> points) const
{
    const bool isMoveExpected = m_elementCount % 2 == 0;
    if (kind == ElementKind::MoveTo)
        return isMoveExpected && (m_points.empty() || points.front() == m_points.back());
    return kind == ElementKind::LineTo && !isMoveExpected;
}

void BezierPath::append(ElementKind kind, std::initializer_list<Point> points)
{
    if (m_isChain && !continuesChain(kind, points))
        keepAllElements();
    if (!m_isChain || m_elementCount == 0 || kind == ElementKind::LineTo) {
        for (const Point point : points) {
            growBounds(point);
            m_points.push_back(point);
        }
    }
    if (!m_isChain)
        m_steps.push_back({ kind, static_cast<std::uint32_t>(m_points.size() - points.size()) });
    ++m_elementCount;
}

void BezierPath::keepAllElements()
{
    std::vector<Step> steps;
    std::vector<Point> points;
    for (int index = 0; index < m_elementCount; ++index) {
        const Element element = elementAtIndex(index);
        steps.push_back({ element.kind, static_cast<std::uint32_t>(points.size()) });
        points.push_back(element.points[0]);
    }
    m_isChain = false;
    m_steps = std::move(steps);
    m_points = std::move(points);
}

void BezierPath::growBounds(Point point)
{
    if (m_points.empty())
        m_lowest = m_highest = point;
    m_lowest = { std::min(m_lowest.x, point.x), std::min(m_lowest.y, point.y) };
    m_highest = { std::max(m_highest.x, point.x), std::max(m_highest.y, point.y) };
}

void BezierPath::moveToPoint(Point point)
{
    append(ElementKind::MoveTo, { point });
}

void BezierPath::lineToPoint(Point point)
{
    append(ElementKind::LineTo, { point });
}

void BezierPath::curveToPoint(Point end, Point control1, Point control2)
{
    append(ElementKind::CurveTo, { control1, control2, end });
}

void BezierPath::closePath()
{
    append(ElementKind::ClosePath, {});
}

Rect BezierPath::controlPointBounds() const
{
    return Rect::spanning(m_lowest, m_highest);
}

QPainterPath BezierPath::CGPath() const
{
    QPainterPath path;
    for (int index = 0; index < elementCount(); ++index) {
        const Element element = elementAtIndex(index);
        switch (element.kind) {
        case ElementKind::MoveTo:
            path.moveTo(toQt(element.points[0]));
            break;
        case ElementKind::LineTo:
            addLine(path, element.points[0]);
            break;
        case ElementKind::CurveTo:
            addCurve(path, element.points);
            break;
        case ElementKind::ClosePath:
            path.closeSubpath();
            break;
        }
    }
    return path;
}

} // namespace penwick::platform
