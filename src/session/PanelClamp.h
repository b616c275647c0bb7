// SPDX-License-Identifier: MIT
// Where a tool bar may stand in its drawing window.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick {

/// `panel`, moved inside `parent`. A panel that is larger than its parent ends flush with the
/// right or the top limit.
[[nodiscard]] platform::Rect clampedPanel(
    const platform::Rect &panel, const platform::Rect &parent);

/// `panel` as it is, if `parent` is high enough for it. Otherwise it is moved into `workArea`; if
/// that is not high enough either, its lower end, which has the button that ends the session, lies
/// inside and its upper end outside.
[[nodiscard]] platform::Rect reachablePanel(
    const platform::Rect &panel, const platform::Rect &parent, const platform::Rect &workArea);

} // namespace penwick
