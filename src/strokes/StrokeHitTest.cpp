// SPDX-License-Identifier: MIT
#include "strokes/StrokeHitTest.h"

#include "strokes/StrokeLines.h"

#include <algorithm>

namespace penwick {

namespace {

using platform::Point;

double dot(Point a, Point b)
{
    return a.x * b.x + a.y * b.y;
}

double squaredDistance(Point point, const StrokeLine &line)
{
    const Point direction = line.to - line.from;
    const double lengthSquared = dot(direction, direction);
    const double part = lengthSquared > 0.0
        ? std::clamp(dot(point - line.from, direction) / lengthSquared, 0.0, 1.0)
        : 0.0;
    const Point nearest { line.from.x + direction.x * part, line.from.y + direction.y * part };
    const Point away = point - nearest;
    return dot(away, away);
}

} // namespace

bool strokeContains(const platform::BezierPath &path, Point point)
{
    if (path.lineWidth() <= 0.0)
        return false; // a path without thickness leaves no mark on the canvas either
    const double radius = path.lineWidth() / 2;
    // The bounds only save the work for points that are far away. They are one point too wide, so
    // that rounding at their border never loses a hit.
    if (!path.controlPointBounds().grownBy(radius + 1).contains(point))
        return false;
    return visitLines(path,
        [point, radius](const StrokeLine &line) { return lineContains(line, radius, point); });
}

bool lineContains(const StrokeLine &line, double radius, Point point)
{
    return squaredDistance(point, line) <= radius * radius;
}

} // namespace penwick
