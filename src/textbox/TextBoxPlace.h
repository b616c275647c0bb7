// SPDX-License-Identifier: MIT
// Where a text box stands, so that what is written in it is seen.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick {

/// A text box becomes no smaller than this, unless the canvas is smaller.
constexpr platform::Size smallestTextBox { 200.0, 30.0 };

/// What the delete button takes beyond the right and the top edge of its box, in points.
constexpr double roomForDeleteButton = 21.0;

// Frames are in the canvas's coordinates, whose origin is its bottom left corner. The size of a
// canvas is rounded down to whole points, because an editor's size is whole: an editor that came
// out half a point too narrow would wrap a line that had just fitted.

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
