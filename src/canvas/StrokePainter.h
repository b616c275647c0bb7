// SPDX-License-Identifier: MIT
// The one way in which strokes are painted.
#pragma once

#include "history/CanvasContent.h"

#include <penwick/platform/Geometry.h>

class QPainter;

namespace penwick {

/// Paints `strokes`, oldest first, each as one shape in its colour, wherever they touch
/// `dirtyRect`; a stroke without a colour takes that of the stroke before it. `painter` has the
/// canvas's coordinates.
///
/// What is painted inside a clip is, pixel for pixel, what painting everything would leave there.
void paintStrokes(
    QPainter &painter, const EntryList<StrokeEntry> &strokes, const platform::Rect &dirtyRect);

} // namespace penwick
