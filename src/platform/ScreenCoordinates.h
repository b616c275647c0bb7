// SPDX-License-Identifier: MIT
// Between Qt's desktop coordinates (y down) and ours (y up from the primary screen's bottom left).
#pragma once

#include <penwick/platform/Geometry.h>

#include <QRect>

namespace penwick::platform {

/// `rect` of Qt's desktop as a rectangle with y up.
[[nodiscard]] Rect fromDesktop(const QRect &rect);
/// The whole pixels of Qt's desktop nearest to `rect`. Place and size are rounded apart, so that
/// a window that only moves keeps its size.
[[nodiscard]] QRect toDesktop(const Rect &rect);

} // namespace penwick::platform
