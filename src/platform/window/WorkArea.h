// SPDX-License-Identifier: MIT
// The desktop's own rule for a window that is shown: it stands inside its screen's work area.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {

/// What the desktop leaves to windows of the screen that has most of `frame`, in points, y up, from
/// the primary screen's bottom left corner. The primary screen's where none has any of it; the
/// whole screen where the toolkit does not know. Another one when screens or the desktop's own
/// bars come and go.
[[nodiscard]] Rect workAreaFor(const Rect &frame);

} // namespace penwick::platform
