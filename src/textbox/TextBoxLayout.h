// SPDX-License-Identifier: MIT
// How large a text box is for its text.
#pragma once

#include <penwick/platform/Geometry.h>

class QTextDocument;

namespace penwick {

constexpr double sidePadding = 5.0; ///< points, left and right of the text
constexpr double bottomPadding = 3.0; ///< points

/// The least that a text box shrinks to.
constexpr platform::Size smallestTextBox { 200.0, 30.0 };

/// How wide a text box at `frame` may become on a canvas of that width: as far as its right edge.
[[nodiscard]] double widestTextBox(const platform::Rect &frame, double canvasWidth);

/// The frame of a box that needs `needed`. Its top left corner stays where it is; what would pass
/// the canvas's bottom edge (y = 0) is not shown.
[[nodiscard]] platform::Rect textBoxFrameFor(
    const platform::Rect &frame, platform::Size needed, double canvasWidth);

/// Lays `text` out for a box at `frame` and returns what it needs.
[[nodiscard]] platform::Size layOutText(
    QTextDocument &text, const platform::Rect &frame, double canvasWidth);

} // namespace penwick
