// SPDX-License-Identifier: MIT
#include "strokes/StrokeLines.h"

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

using platform::BezierPath;
using platform::Point;

// How far the chords that stand for a curve may lie from it, in points: well below a pixel.
constexpr double curveTolerance = 0.01;
constexpr double mostChords = 10'000.0; // bounds the work, however large the coordinates

double dot(Point a, Point b)
{
    return a.x * b.x + a.y * b.y;
}

Point along(Point from, Point to, double part)
{
    return { from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part };
}

void addCurve(std::vector<StrokeLine> &lines, Point start, const std::array<Point, 3> &points)
{
    const auto &[control1, control2, end] = points;
    // With n equal steps of the parameter a chord is at most max|B''| / (8 n^2) from the curve, and
    // |B''| is at most six times the larger second difference of the points.
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
        lines.push_back({ previous, next });
        previous = next;
    }
}

} // namespace

std::vector<StrokeLine> linesOf(const BezierPath &path)
{
    std::vector<StrokeLine> lines;
    Point current;
    Point subpathStart;
    for (int index = 0; index < path.elementCount(); ++index) {
        const BezierPath::Element element = path.elementAtIndex(index);
        const Point before = current;
        switch (element.kind) {
        case BezierPath::ElementKind::MoveTo:
            current = subpathStart = element.points[0];
            break;
        case BezierPath::ElementKind::LineTo:
            current = element.points[0];
            lines.push_back({ before, current });
            break;
        case BezierPath::ElementKind::CurveTo:
            current = element.points[2];
            addCurve(lines, before, element.points);
            break;
        case BezierPath::ElementKind::ClosePath:
            current = subpathStart;
            lines.push_back({ before, current });
            break;
        }
    }
    return lines;
}

} // namespace penwick
