// SPDX-License-Identifier: MIT
#include "canvas/StrokeHitTest.h"

#include <penwick/platform/BezierPath.h>

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

using platform::BezierPath;
using platform::Point;

// How far the chords that stand for a curve may lie from it, in points: well below a pixel.
constexpr double curveTolerance = 0.01;
constexpr double mostChords = 10'000.0; // whatever the coordinates, an answer comes in time

double dot(Point a, Point b)
{
    return a.x * b.x + a.y * b.y;
}

Point along(Point from, Point to, double part)
{
    return { from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part };
}

/// A disc around the point asked for. The stroke contains that point where its centre line
/// touches the disc.
struct Disc
{
    Point center;
    double radius = 0.0;

    [[nodiscard]] bool touchesLine(Point start, Point end) const
    {
        const Point direction = end - start;
        const double lengthSquared = dot(direction, direction);
        const double part = lengthSquared > 0.0
            ? std::clamp(dot(center - start, direction) / lengthSquared, 0.0, 1.0)
            : 0.0;
        const Point away = center - along(start, end, part);
        return dot(away, away) <= radius * radius;
    }

    [[nodiscard]] bool touchesCurve(Point start, Point control1, Point control2, Point end) const
    {
        // With n equal steps of the parameter a chord is at most max|B''| / (8 n^2) from the
        // curve, and |B''| is at most six times the larger second difference of the points.
        const Point bend1 = start - control1 - (control1 - control2);
        const Point bend2 = control1 - control2 - (control2 - end);
        const double bend = std::sqrt(std::max(dot(bend1, bend1), dot(bend2, bend2)));
        const double wanted = std::ceil(std::sqrt(0.75 * bend / curveTolerance));
        const int steps = std::max(1, static_cast<int>(std::min(mostChords, wanted)));

        Point previous = start;
        for (int step = 1; step <= steps; ++step) {
            const double part = static_cast<double>(step) / steps;
            const Point first = along(start, control1, part);
            const Point middle = along(control1, control2, part);
            const Point last = along(control2, end, part);
            const Point next = along(along(first, middle, part), along(middle, last, part), part);
            if (touchesLine(previous, next))
                return true;
            previous = next;
        }
        return false;
    }
};

} // namespace

bool strokeContains(const BezierPath &path, Point point)
{
    if (path.lineWidth() <= 0.0)
        return false; // it leaves no mark either
    const Disc disc { point, path.lineWidth() / 2 };
    // One point wider than need be: only a short cut, it must not decide at the very edge.
    if (!path.controlPointBounds().grownBy(disc.radius + 1).contains(point))
        return false;

    Point current;
    Point subpathStart;
    for (int index = 0; index < path.elementCount(); ++index) {
        const BezierPath::Element element = path.elementAtIndex(index);
        const Point before = current;
        bool isHit = false;
        switch (element.kind) {
        case BezierPath::ElementKind::MoveTo:
            current = subpathStart = element.points[0];
            break;
        case BezierPath::ElementKind::LineTo:
            current = element.points[0];
            isHit = disc.touchesLine(before, current);
            break;
        case BezierPath::ElementKind::CurveTo:
            current = element.points[2];
            isHit = disc.touchesCurve(before, element.points[0], element.points[1], current);
            break;
        case BezierPath::ElementKind::ClosePath:
            current = subpathStart;
            isHit = disc.touchesLine(before, current);
            break;
        }
        if (isHit)
            return true;
    }
    return false;
}

} // namespace penwick
