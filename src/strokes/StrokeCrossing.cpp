// SPDX-License-Identifier: MIT
#include "strokes/StrokeCrossing.h"

#include "strokes/StrokeHitTest.h"
#include "strokes/StrokeLines.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>
#include <vector>

namespace penwick {

namespace {

using platform::Point;
using platform::Rect;

constexpr double surelyOnIt = 1e-6; // points beyond a stroke's edge

double dot(Point a, Point b)
{
    return a.x * b.x + a.y * b.y;
}

double cross(Point a, Point b)
{
    return a.x * b.y - a.y * b.x;
}

/// A piece of a way, between two parts as in Way::at(). It is empty where it ends before it begins,
/// as a new Span does.
struct Span
{
    double begin = std::numeric_limits<double>::infinity();
    double end = -std::numeric_limits<double>::infinity();

    void include(const Span &other)
    {
        if (other.begin > other.end)
            return;
        begin = std::min(begin, other.begin);
        end = std::max(end, other.end);
    }
};

constexpr Span wholeWay { 0.0, 1.0 };

/// The piece of `span` in which start + part * slope lies between `lowest` and `highest`.
Span within(Span span, double start, double slope, double lowest, double highest)
{
    if (slope == 0.0)
        return start < lowest || start > highest ? Span() : span;
    const double first = (lowest - start) / slope;
    const double second = (highest - start) / slope;
    return { std::max(span.begin, std::min(first, second)),
        std::min(span.end, std::max(first, second)) };
}

Span spanOnDisc(const Way &way, Point centre, double radius)
{
    const Point direction = way.to - way.from;
    const Point start = way.from - centre;
    const double square = dot(direction, direction);
    const double toNearest = -dot(start, direction) / square;
    const double away = cross(start, direction); // the centre's distance, times the way's length
    const double halfSquare = radius * radius * square - away * away;
    if (halfSquare < 0.0)
        return {};
    const double half = std::sqrt(halfSquare) / square;
    return { std::max(0.0, toNearest - half), std::min(1.0, toNearest + half) };
}

/// The piece of the way inside the rectangle that reaches `radius` to both sides of the line; the
/// round ends are no part of it.
Span spanBesideLine(const Way &way, const StrokeLine &line, double radius)
{
    const Point lineDirection = line.to - line.from;
    const double length = std::hypot(lineDirection.x, lineDirection.y);
    if (length == 0.0)
        return {};
    const Point unit { lineDirection.x / length, lineDirection.y / length };
    const Point direction = way.to - way.from;
    const Point start = way.from - line.from;
    const Span along = within(wholeWay, dot(start, unit), dot(direction, unit), 0.0, length);
    return within(along, cross(unit, start), cross(unit, direction), -radius, radius);
}

/// The piece of the way on a thick line with round ends. There is only one, because that shape is
/// convex: a straight way enters and leaves it at most once.
Span spanOnLine(const Way &way, const StrokeLine &line, double radius)
{
    Span span;
    span.include(spanBesideLine(way, line, radius));
    span.include(spanOnDisc(way, line.from, radius));
    span.include(spanOnDisc(way, line.to, radius));
    return span;
}

bool isApart(const Rect &area, const StrokeLine &line)
{
    return std::max(line.from.x, line.to.x) < area.x
        || std::min(line.from.x, line.to.x) > area.maxX()
        || std::max(line.from.y, line.to.y) < area.y
        || std::min(line.from.y, line.to.y) > area.maxY();
}

/// The first place on `spans` for which strokeContains() holds as well. Each span is tried just
/// behind its beginning and, because rounding may still deny that place, in its middle.
std::optional<double> firstOn(
    const Way &way, const platform::BezierPath &path, std::vector<Span> spans)
{
    std::ranges::sort(spans, {}, &Span::begin);
    for (const Span &span : spans) {
        const double middle = (span.begin + span.end) / 2;
        const double behindEdge = span.begin + surelyOnIt / way.length();
        for (const double part : { std::min(behindEdge, middle), middle }) {
            if (strokeContains(path, way.at(part)))
                return part;
        }
    }
    return std::nullopt;
}

} // namespace

double Way::length() const
{
    return std::hypot(to.x - from.x, to.y - from.y);
}

Point Way::at(double part) const
{
    return { from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part };
}

Meeting meetingOn(const Way &way, const platform::BezierPath &path)
{
    if (path.lineWidth() <= 0.0)
        return {};
    const double length = way.length();
    const double radius = path.lineWidth() / 2;
    // The rectangle only saves the work for lines that are far away. It is a little too wide, so
    // that rounding at its border never loses a line that is met.
    const Rect area = Rect::spanning(way.from, way.to).grownBy(radius + surelyOnIt);
    Meeting meeting;
    std::vector<Span> spans;
    visitLines(path, [&](const StrokeLine &line) {
        if (isApart(area, line))
            return false;
        meeting.isAtEnd = meeting.isAtEnd || lineContains(line, radius, way.to);
        const Span span = length > 0.0 ? spanOnLine(way, line, radius) : Span();
        if (span.begin < span.end && (1.0 - span.begin) * length > surelyOnIt)
            spans.push_back(span);
        return false;
    });
    meeting.part = firstOn(way, path, std::move(spans));
    return meeting;
}

} // namespace penwick
