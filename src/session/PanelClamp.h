// SPDX-License-Identifier: MIT
// Where a tool bar may stand in its drawing window.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick {

/// `panel`, moved inside `parent`. A panel that is larger than its parent ends flush with the
/// right or the top limit.
[[nodiscard]] platform::Rect clampedPanel(
    const platform::Rect &panel, const platform::Rect &parent);

/// `panel`, where it is higher than `parent` has room for, moved up or down into `workArea`; one
/// that is higher than that too keeps its lower end there, which ends the session. Never sideways:
/// on its way to another screen it would not stay beside its parent.
[[nodiscard]] platform::Rect reachablePanel(
    const platform::Rect &panel, const platform::Rect &parent, const platform::Rect &workArea);

} // namespace penwick
