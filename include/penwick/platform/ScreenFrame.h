// SPDX-License-Identifier: MIT
// Where a screen is.
#pragma once

#include <penwick/Export.h>
#include <penwick/platform/Geometry.h>

class QScreen;

namespace penwick::platform {

/// `screen`'s area, in points, y up, from the primary screen's bottom left corner.
[[nodiscard]] PENWICK_EXPORT Rect frameOfScreen(const QScreen &screen);

} // namespace penwick::platform
