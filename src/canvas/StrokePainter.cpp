// SPDX-License-Identifier: MIT
#include "canvas/StrokePainter.h"

#include <QPainter>
#include <QPainterPath>
#include <QPen>

namespace penwick {

namespace {

using platform::BezierPath;
using platform::Point;
using platform::Rect;

// Smooth edges reach into the pixel next to the shape's own.
constexpr double edge = 1.0; // points

// Up to this width Qt takes a short cut for a pen, whose pixels stray as far as two points from
// the line and so out of what is painted again for it.
constexpr double hairline = 1.0; // points

QPointF toQt(Point point)
{
    return { point.x, point.y };
}

Qt::PenCapStyle toQt(platform::LineCapStyle style)
{
    switch (style) {
    case platform::LineCapStyle::Butt:
        return Qt::FlatCap;
    case platform::LineCapStyle::Round:
        return Qt::RoundCap;
    case platform::LineCapStyle::Square:
        return Qt::SquareCap;
    }
    return Qt::FlatCap;
}

Qt::PenJoinStyle toQt(platform::LineJoinStyle style)
{
    switch (style) {
    case platform::LineJoinStyle::Miter:
        return Qt::MiterJoin;
    case platform::LineJoinStyle::Round:
        return Qt::RoundJoin;
    case platform::LineJoinStyle::Bevel:
        return Qt::BevelJoin;
    }
    return Qt::MiterJoin;
}

// Segments that follow each other are one line, so that no end caps thicken the edges where they
// meet. A path drops a line that leads nowhere, but a pointer that stayed where it was leaves a
// dot.
void addSegment(QPainterPath &path, Point from, Point to)
{
    constexpr double almostNothing = 0.001; // points
    if (path.isEmpty() || path.currentPosition() != toQt(from))
        path.moveTo(toQt(from));
    path.lineTo(from == to ? QPointF(to.x + almostNothing, to.y) : toQt(to));
}

bool touches(Point from, Point to, double reach, const Rect &area)
{
    return Rect::spanning(from, to).grownBy(reach).intersects(area);
}

// Qt's stroker costs more than linearly in the segments that overlap, so only those that reach
// the area are handed to it; the pixels there are the same.
QPainterPath segmentsTouching(const BezierPath &stroke, double reach, const Rect &area)
{
    QPainterPath path;
    Point from;
    for (int index = 0; index < stroke.elementCount(); ++index) {
        const BezierPath::Element element = stroke.elementAtIndex(index);
        switch (element.kind) {
        case BezierPath::ElementKind::MoveTo:
            from = element.points[0];
            break;
        case BezierPath::ElementKind::LineTo:
            if (touches(from, element.points[0], reach, area))
                addSegment(path, from, element.points[0]);
            from = element.points[0];
            break;
        default: // strokes are made of straight segments only; anything else is painted whole
            return stroke.CGPath();
        }
    }
    return path;
}

void paintShape(QPainter &painter, const QPainterPath &segments, const QPen &pen)
{
    if (pen.widthF() > hairline) {
        painter.setPen(pen);
        painter.drawPath(segments);
        return;
    }
    QPainterPath outline = QPainterPathStroker(pen).createStroke(segments);
    outline.setFillRule(Qt::WindingFill);
    painter.fillPath(outline, pen.brush());
}

} // namespace

void paintStrokes(QPainter &painter, const EntryList<StrokeEntry> &strokes, const Rect &dirtyRect)
{
    QPen pen(painter.pen().color(), 1.0, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin);
    painter.setBrush(Qt::NoBrush);
    for (const StrokeEntry &stroke : strokes) {
        if (stroke.bPathParams.pathColor)
            pen.setColor(*stroke.bPathParams.pathColor);
        const BezierPath &path = *stroke.bPath;
        const double reach = path.lineWidth() / 2 + edge;
        // Whoever asked for a line without thickness gets one that cannot be seen.
        if (path.elementCount() == 0 || path.lineWidth() <= 0.0
            || !path.controlPointBounds().grownBy(reach).intersects(dirtyRect))
            continue;
        pen.setWidthF(path.lineWidth());
        pen.setCapStyle(toQt(path.lineCapStyle()));
        pen.setJoinStyle(toQt(path.lineJoinStyle()));
        paintShape(painter, segmentsTouching(path, reach, dirtyRect), pen);
    }
}

} // namespace penwick
