// SPDX-License-Identifier: MIT
// The one way in which strokes are painted.
#pragma once

#include "content/CanvasContent.h"

#include <QRect>

class QColor;

namespace penwick {

class CoverageMask;
class PixelLayer;

/// The pixels that `stroke` may touch where a point has `scale` pixels; empty for a stroke that
/// leaves no mark.
[[nodiscard]] QRect pixelsOf(const StrokeEntry &stroke, double scale);

/// Adds the stroke's lines to `mask`; if its path is a chain, without the first `skippedLines`.
/// Ends and joins are always round, whatever the path's own styles say. Returns the pixels that
/// these lines may touch, also those outside the mask.
QRect addStroke(
    CoverageMask &mask, const StrokeEntry &stroke, double scale, std::size_t skippedLines = 0);

/// The colour of a stroke: its own, or that of the nearest older stroke which has one, or black.
[[nodiscard]] QColor colorOf(const EntryList<StrokeEntry> &strokes, int index);

/// Paints `stroke` into `layer`, as one shape, but only inside `area`. The mask `scratch` is
/// overwritten; the caller keeps it so that its memory serves the next stroke too.
void paintStroke(PixelLayer &layer, const StrokeEntry &stroke, const QColor &color, double scale,
    const QRect &area, CoverageMask &scratch);

} // namespace penwick
