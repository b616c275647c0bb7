// SPDX-License-Identifier: MIT
// How true the edges of strokes are, and what they cost, beside the toolkit's own.
#pragma once

namespace penwick::bench {

/// Prints, as Markdown, the largest and the mean error of strokes against a picture with 256
/// samples a pixel, and the time of a segment: as this component paints them, and as the toolkit
/// strokes the same path.
void printAccuracy();

} // namespace penwick::bench
