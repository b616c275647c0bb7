// SPDX-License-Identifier: MIT
// The work area: the part of a screen that the desktop leaves to windows.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {

/// The work area of the screen that has most of `frame`, in points, y up, from the primary screen's
/// bottom left corner; of the primary screen if none has any of it; the whole screen if the toolkit
/// knows no work area. It changes when screens or the desktop's own bars come and go.
[[nodiscard]] Rect workAreaFor(const Rect &frame);

} // namespace penwick::platform
