// SPDX-License-Identifier: MIT
// Where a text box stands, so that what is written in it is seen.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick {

/// The least that a text box shrinks to, where the canvas is that large.
constexpr platform::Size smallestTextBox { 200.0, 30.0 };

/// What the delete button takes beyond the right and the top edge of its box, in points.
constexpr double roomForDeleteButton = 21.0;

// Frames are in the canvas's coordinates, whose origin is its bottom left corner. A canvas is taken
// in whole points, as the editor is: half a point less would wrap what has just fitted.

/// The frame of a box that is being written in and needs `needed`.
///
/// It grows to the right and downwards from its top left corner, which moves only as far as it must
/// for the whole box to lie on the canvas, and with it, where there is room for both, the delete
/// button. No box is larger than the canvas.
[[nodiscard]] platform::Rect frameInSight(
    const platform::Rect &frame, platform::Size needed, platform::Size canvas);

/// The frame of a box that was let go at `frame`: moved only as far as it must for 20 points of it,
/// each way, to lie on the canvas.
[[nodiscard]] platform::Rect frameInReach(const platform::Rect &frame, platform::Size canvas);

} // namespace penwick
