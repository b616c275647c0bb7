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

/// `frame` moved by as little as brings it inside `area`; never resized. One that is wider than
/// `area` keeps its left edge in it, one that is higher the edge that `edge` names.
[[nodiscard]] Rect broughtInside(
    const Rect &frame, const Rect &area, KeptEdge edge = KeptEdge::Top);

/// The same, beside `free`, which is to stay uncovered: where `frame` cannot be on its own side of
/// it, it stands on the other one at the same distance, or nearer where there is no room for that,
/// or else above or below. Only where there is room on no side at all does it cover `free`.
[[nodiscard]] Rect broughtInsideBeside(const Rect &frame, const Rect &area, const Rect &free);

} // namespace penwick::platform
