// SPDX-License-Identifier: MIT
// Points, sizes and rectangles with the y axis upwards.
// Qt's own types are not used for these because Qt's mean "y down": a QRectF whose top() is its
// lower edge is read wrongly sooner or later. Mixing the two does not compile.
#pragma once

#include <algorithm>

namespace penwick::platform {

/// A place, in points; x to the right, y up. Whoever uses a point says where its origin is.
struct Point
{
    double x = 0.0;
    double y = 0.0;

    friend bool operator==(const Point &, const Point &) = default; ///< exact, not fuzzy
    friend Point operator+(Point a, Point b) { return { a.x + b.x, a.y + b.y }; }
    friend Point operator-(Point a, Point b) { return { a.x - b.x, a.y - b.y }; }
};

/// An extent, in points. Neither member is negative.
struct Size
{
    double width = 0.0;
    double height = 0.0;

    friend bool operator==(const Size &, const Size &) = default;
};

/// A rectangle, in points: (x, y) is its bottom left corner.
struct Rect
{
    double x = 0.0;
    double y = 0.0; ///< bottom edge
    double width = 0.0; ///< 0 or more
    double height = 0.0; ///< 0 or more

    [[nodiscard]] Point origin() const { return { x, y }; }
    [[nodiscard]] Size size() const { return { width, height }; }
    [[nodiscard]] double maxX() const { return x + width; }
    [[nodiscard]] double maxY() const { return y + height; } ///< top edge

    /// Whether `point` lies inside; the left and bottom edges belong to the rectangle, the right
    /// and top edges do not.
    [[nodiscard]] bool contains(Point point) const
    {
        return point.x >= x && point.x < maxX() && point.y >= y && point.y < maxY();
    }

    /// Whether the two share any area.
    [[nodiscard]] bool intersects(const Rect &other) const
    {
        return x < other.maxX() && other.x < maxX() && y < other.maxY() && other.y < maxY();
    }

    /// The same rectangle, larger by `margin` on every side.
    [[nodiscard]] Rect grownBy(double margin) const
    {
        return { x - margin, y - margin, width + 2 * margin, height + 2 * margin };
    }

    /// The smallest rectangle that holds both points.
    [[nodiscard]] static Rect spanning(Point a, Point b)
    {
        const Point low { std::min(a.x, b.x), std::min(a.y, b.y) };
        const Point high { std::max(a.x, b.x), std::max(a.y, b.y) };
        return { low.x, low.y, high.x - low.x, high.y - low.y };
    }

    friend bool operator==(const Rect &, const Rect &) = default;
};

} // namespace penwick::platform
