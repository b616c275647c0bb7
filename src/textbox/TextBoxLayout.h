// SPDX-License-Identifier: MIT
// How much room a text needs.
#pragma once

#include <penwick/platform/Geometry.h>

class QTextDocument;

namespace penwick {

constexpr double sidePadding = 5.0; ///< points, left and right of the text
constexpr double bottomPadding = 3.0; ///< points

/// Lays `text` out for a box on a canvas that is `canvasWidth` wide and returns what it needs,
/// paddings included. A line is wrapped only where it is longer than the canvas is wide; a text
/// with such a line needs all of that width.
[[nodiscard]] platform::Size layOutText(QTextDocument &text, double canvasWidth);

} // namespace penwick
