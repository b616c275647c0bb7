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
        return false; // it leaves no mark either
    const double radius = path.lineWidth() / 2;
    // One point wider than need be: only a short cut, it must not decide at the very edge.
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
