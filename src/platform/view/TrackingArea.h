// SPDX-License-Identifier: MIT
// The part of a view over which the pointer's coming and going is told.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {

/// Kept as it is set, but without effect: every widget is told of the pointer anyway, over the
/// whole of its present bounds.
struct TrackingArea
{
    static constexpr unsigned mouseEnteredAndExited = 0x01;
    static constexpr unsigned mouseMoved = 0x02;
    static constexpr unsigned activeAlways = 0x80;

    Rect rect; ///< in the view's coordinates
    unsigned options = mouseEnteredAndExited | activeAlways;

    friend bool operator==(const TrackingArea &, const TrackingArea &) = default;
};

} // namespace penwick::platform
