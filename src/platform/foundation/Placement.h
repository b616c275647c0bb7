// SPDX-License-Identifier: MIT
// Where one rectangle stands inside another.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {

/// Which edge of a window stays in reach when the window is higher than the work area.
enum class KeptEdge
{
    Top, ///< as for a window with a title bar
    Bottom
};

/// `frame` moved into `area`, no farther than it must be, and never resized. A frame that is wider
/// than `area` keeps its left edge inside, one that is higher the edge that `edge` names.
[[nodiscard]] Rect broughtInside(
    const Rect &frame, const Rect &area, KeptEdge edge = KeptEdge::Top);

/// Like broughtInside(), but leaves `free` uncovered. If `frame` cannot be on its own side of
/// `free`, it goes to the other side, at the same distance or nearer if there is less room, or else
/// above or below. It covers `free` only if there is room on no side.
[[nodiscard]] Rect broughtInsideBeside(const Rect &frame, const Rect &area, const Rect &free);

} // namespace penwick::platform
