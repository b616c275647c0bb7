// SPDX-License-Identifier: MIT
// The one way in which strokes are painted.
#pragma once

#include "content/CanvasContent.h"

#include <QRect>

class QColor;

namespace penwick {

class CoverageMask;
class PixelLayer;

/// The pixels that `stroke` may touch where a point has `scale` pixels; empty for one that leaves
/// no mark.
[[nodiscard]] QRect pixelsOf(const StrokeEntry &stroke, double scale);

/// Adds the stroke's lines to `mask`; of a chain, without the first `skippedLines`. Every stroke is
/// painted with round ends and joins, like the pen that it was drawn with. Gives the pixels that
/// these lines may touch, inside the mask or not.
QRect addStroke(
    CoverageMask &mask, const StrokeEntry &stroke, double scale, std::size_t skippedLines = 0);

/// The colour of a stroke: its own, or that of the nearest stroke before it which has one.
[[nodiscard]] QColor colorOf(const EntryList<StrokeEntry> &strokes, int index);

/// Paints `stroke` into the part of `layer` that is `area`, as one shape. `scratch` is overwritten;
/// it is handed in to be used again.
void paintStroke(PixelLayer &layer, const StrokeEntry &stroke, const QColor &color, double scale,
    const QRect &area, CoverageMask &scratch);

} // namespace penwick
