// SPDX-License-Identifier: MIT
// Strokes: a plain one, and any at random places for properties that hold for every drawing.
#pragma once

#include "content/CanvasContent.h"

#include <penwick/platform/BezierPath.h>

#include <rapidcheck.h>

#include <QColor>

#include <memory>
#include <optional>

namespace penwick::test {

constexpr int side = 120; // points; strokes also leave it

/// A horizontal stroke, four points thick.
inline StrokeEntry lineAt(double y)
{
    auto path = std::make_shared<platform::BezierPath>();
    path->setLineWidth(4.0);
    path->moveToPoint({ 10, y });
    path->lineToPoint({ 50, y });
    const std::int64_t id = path->hash();
    return { std::move(path), { platform::Point { 50, y }, std::nullopt, Qt::black }, id };
}

inline platform::Point anyPoint()
{
    const auto coordinate = [] { return *rc::gen::inRange(-20 * 4, (side + 20) * 4) / 4.0; };
    const double x = coordinate();
    return { x, coordinate() };
}

/// Extends a stroke as the model does, to a point near its last one.
inline void extend(StrokeEntry &stroke)
{
    const platform::Point from = stroke.bPathParams.startPoint.value_or(platform::Point());
    const platform::Point to { from.x + *rc::gen::inRange(-60, 61) / 4.0,
        from.y + *rc::gen::inRange(-60, 61) / 4.0 };
    stroke.bPath->moveToPoint(from);
    stroke.bPath->lineToPoint(to);
    stroke.bPathParams.startPoint = to;
}

/// A stroke without segments.
inline StrokeEntry newStroke()
{
    auto path = std::make_shared<platform::BezierPath>();
    path->setLineWidth(*rc::gen::element(0.5, 1.0, 3.0, 5.0, 12.0, 30.0));
    const std::int64_t id = path->hash();
    const QColor color(*rc::gen::inRange(0, 256), *rc::gen::inRange(0, 256),
        *rc::gen::inRange(0, 256), *rc::gen::element(60, 178, 255));
    const bool hasColor = *rc::gen::inRange(0, 8) > 0;
    return { std::move(path),
        { anyPoint(), std::nullopt, hasColor ? std::optional(color) : std::nullopt }, id };
}

inline StrokeEntry anyStroke()
{
    StrokeEntry stroke = newStroke();
    for (int left = *rc::gen::inRange(0, 8); left > 0; --left)
        extend(stroke);
    return stroke;
}

/// A drawing on which everything happens that a model does: strokes begin, grow, leave from
/// anywhere, come back at the end, and all leave at once.
class AnyDrawing
{
public:
    [[nodiscard]] const EntryList<StrokeEntry> &strokes() const { return m_strokes; }

    void change()
    {
        switch (*rc::gen::weightedElement<int>(
            { { 3, 0 }, { 6, 1 }, { 2, 2 }, { 2, 3 }, { 2, 4 }, { 1, 5 } })) {
        case 0:
            m_strokes.append(newStroke());
            break;
        case 1:
            if (!m_strokes.isEmpty())
                extend(m_strokes.mutableLast());
            break;
        case 2:
            if (!m_strokes.isEmpty())
                removeAt(*rc::gen::inRange(0, m_strokes.size()));
            break;
        case 3:
            if (!m_strokes.isEmpty())
                removeAt(m_strokes.size() - 1);
            break;
        case 4:
            if (m_gone) {
                m_strokes.append(*m_gone);
                m_gone.reset();
            }
            break;
        default:
            std::swap(m_strokes, m_cleared);
        }
    }

private:
    void removeAt(int index)
    {
        m_gone = m_strokes[index];
        m_strokes.removeAt(index);
    }

    EntryList<StrokeEntry> m_strokes;
    EntryList<StrokeEntry> m_cleared;
    std::optional<StrokeEntry> m_gone;
};

} // namespace penwick::test
