// SPDX-License-Identifier: MIT
#include "session/PanelClamp.h"

#include "platform/foundation/Placement.h"

namespace penwick {

namespace {

constexpr double margin = 3.0; // points
// A panel that was pushed out on the left comes back this much farther than the margin, so that it
// stands clear of the edge.
constexpr double leftSnap = 20.0; // points
constexpr double titleBar = 22.0; // points, of the parent

} // namespace

platform::Rect clampedPanel(const platform::Rect &panel, const platform::Rect &parent)
{
    platform::Rect clamped = panel;
    if (clamped.x < parent.x + margin)
        clamped.x = parent.x + margin + leftSnap;
    if (clamped.y < parent.y + margin)
        clamped.y = parent.y + margin;
    if (parent.maxY() - margin - titleBar < clamped.maxY())
        clamped.y = parent.maxY() - titleBar - margin - clamped.height;
    if (parent.maxX() - margin < clamped.maxX())
        clamped.x = parent.maxX() - margin - clamped.width;
    return clamped;
}

platform::Rect reachablePanel(
    const platform::Rect &panel, const platform::Rect &parent, const platform::Rect &workArea)
{
    if (panel.height <= parent.height - titleBar - 2 * margin)
        return panel;
    return platform::broughtInside(panel, workArea, platform::KeptEdge::Bottom);
}

} // namespace penwick
