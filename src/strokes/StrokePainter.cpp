// SPDX-License-Identifier: MIT
#include "strokes/StrokePainter.h"

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"
#include "strokes/StrokeLines.h"

#include <penwick/platform/BezierPath.h>

#include <QColor>

namespace penwick {

using platform::BezierPath;
using platform::Point;
using platform::Rect;

namespace {

double radiusOf(const BezierPath &path, double scale)
{
    return path.lineWidth() / 2 * scale;
}

Point scaled(Point point, double scale)
{
    return { point.x * scale, point.y * scale };
}

} // namespace

QRect pixelsOf(const StrokeEntry &stroke, double scale)
{
    const BezierPath &path = *stroke.bPath;
    if (path.elementCount() == 0 || path.lineWidth() <= 0.0)
        return {};
    const Rect bounds = path.controlPointBounds();
    return pixelsOfCapsule(scaled(bounds.origin(), scale),
        scaled({ bounds.maxX(), bounds.maxY() }, scale), radiusOf(path, scale));
}

QRect addStroke(
    CoverageMask &mask, const StrokeEntry &stroke, double scale, std::size_t skippedLines)
{
    const BezierPath &path = *stroke.bPath;
    if (path.lineWidth() <= 0.0)
        return {}; // a path without thickness leaves no mark
    const double radius = radiusOf(path, scale);
    QRect touched;
    const auto add = [&](const StrokeLine &line) {
        touched |= mask.addCapsule(scaled(line.from, scale), scaled(line.to, scale), radius);
        return false;
    };
    visitLines(path, add, skippedLines);
    return touched;
}

QColor colorOf(const EntryList<StrokeEntry> &strokes, int index)
{
    for (; index >= 0; --index) {
        if (const auto &color = strokes[index].bPathParams.pathColor)
            return *color;
    }
    return Qt::black;
}

void paintStroke(PixelLayer &layer, const StrokeEntry &stroke, const QColor &color, double scale,
    const QRect &area, CoverageMask &scratch)
{
    const QRect touched = pixelsOf(stroke, scale) & area & layer.area();
    if (touched.isEmpty())
        return;
    scratch.reset(touched);
    addStroke(scratch, stroke, scale);
    layer.blend(scratch, color, touched);
}

} // namespace penwick
