// SPDX-License-Identifier: MIT
// A path of moves, lines and curves with its own line attributes and an identity.
#pragma once

#include <penwick/Export.h>
#include <penwick/platform/Geometry.h>

#include <QPainterPath>

#include <array>
#include <cstdint>
#include <initializer_list>
#include <span>
#include <vector>

namespace penwick::platform {

enum class LineCapStyle
{
    Butt = 0,
    Round = 1,
    Square = 2
};
enum class LineJoinStyle
{
    Miter = 0,
    Round = 1,
    Bevel = 2
};

/// A path with an identity: two paths with the same geometry are still two.
///
/// A path is a chain if it consists of lines alone, and each has before it a move to where the last
/// line ended. A stroke that is drawn by hand is a chain. A chain is kept as one point for each
/// line, any other path as all its elements.
///
/// Coordinates are points, y up, in the space of whatever draws it. Never copied; shared by
/// reference. GUI thread only.
class PENWICK_EXPORT BezierPath
{
public:
    enum class ElementKind : std::uint8_t
    {
        MoveTo,
        LineTo,
        CurveTo,
        ClosePath
    };

    /// One step of the path. MoveTo and LineTo use points[0]; CurveTo has its two control points
    /// in points[0] and points[1] and its end in points[2]; ClosePath uses none.
    struct Element
    {
        ElementKind kind = ElementKind::MoveTo;
        std::array<Point, 3> points {};
    };

    BezierPath();
    BezierPath(const BezierPath &) = delete;
    BezierPath &operator=(const BezierPath &) = delete;

    /// Identity of this object: unique in the process, the same for the object's whole life.
    [[nodiscard]] std::int64_t hash() const { return m_hash; }

    [[nodiscard]] int elementCount() const { return m_elementCount; }
    /// The element at `index`, which must be from 0 to elementCount() - 1.
    [[nodiscard]] Element elementAtIndex(int index) const;

    /// The points that the lines of a chain go through; empty for a path that is no chain and for
    /// one without elements. Valid until the path changes.
    [[nodiscard]] std::span<const Point> chain() const;

    void moveToPoint(Point point);
    void lineToPoint(Point point);
    void curveToPoint(Point end, Point control1, Point control2);
    void closePath();

    [[nodiscard]] double lineWidth() const { return m_lineWidth; }
    void setLineWidth(double width) { m_lineWidth = width; } ///< points
    [[nodiscard]] LineCapStyle lineCapStyle() const { return m_lineCapStyle; }
    void setLineCapStyle(LineCapStyle style) { m_lineCapStyle = style; }
    [[nodiscard]] LineJoinStyle lineJoinStyle() const { return m_lineJoinStyle; }
    void setLineJoinStyle(LineJoinStyle style) { m_lineJoinStyle = style; }

    /// The smallest rectangle that holds every point of the path, control points included, and so
    /// the path itself, its thickness aside. Empty at the origin for a path without elements.
    /// Costs the same for every path.
    [[nodiscard]] Rect controlPointBounds() const;

    /// A new QPainterPath with the same moves, lines and curves in the same order and coordinates,
    /// also those without length; empty for a path without elements. Built at every call.
    ///
    /// A QPainterPath cannot hold all elements as they are. Closing becomes a line back to where
    /// the sub-path began, or nothing if it ends there already; a line or curve right after closing
    /// gets a move to that place before it. Of several moves in a row only the last is kept. A path
    /// that begins with a line or a curve gets a move to the origin before it.
    [[nodiscard]] QPainterPath CGPath() const; // NOLINT(readability-identifier-naming): fixed name

private:
    struct Step
    {
        ElementKind kind;
        std::uint32_t firstPoint;
    };

    [[nodiscard]] bool continuesChain(ElementKind kind, std::span<const Point> points) const;
    void append(ElementKind kind, std::initializer_list<Point> points);
    void keepAllElements();
    void growBounds(Point point);

    const std::int64_t m_hash;
    double m_lineWidth = 1.0;
    LineCapStyle m_lineCapStyle = LineCapStyle::Butt;
    LineJoinStyle m_lineJoinStyle = LineJoinStyle::Miter;
    int m_elementCount = 0;
    bool m_isChain = true;
    std::vector<Step> m_steps; // empty for a chain
    std::vector<Point> m_points;
    Point m_lowest; // corners of the bounds; meaningful once there is a point
    Point m_highest;
};

} // namespace penwick::platform
