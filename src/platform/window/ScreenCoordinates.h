// SPDX-License-Identifier: MIT
// Between Qt's desktop coordinates (y down) and ours (y up from the primary screen's bottom left).
#pragma once

#include <penwick/platform/Geometry.h>

#include <QRect>

namespace penwick::platform {

/// The primary screen's bottom left corner in Qt's desktop. It changes when screens come and go.
[[nodiscard]] QPoint originInDesktop();

/// A place in device pixels, on a screen of `scale` whose corner is `screen`, in Qt's desktop,
/// which keeps a screen's corner in device pixels and scales what lies inside it.
[[nodiscard]] QPoint fromPixels(QPoint pixels, QPoint screen, double scale);

/// `rect` of Qt's desktop as a rectangle with y up.
[[nodiscard]] Rect fromDesktop(const QRectF &rect);
/// `rect` with y up as a rectangle of Qt's desktop.
[[nodiscard]] QRectF toDesktopExactly(const Rect &rect);
/// The whole pixels nearest to `rect` of Qt's desktop. Place and size are rounded apart, so that a
/// window that only moves keeps its size.
[[nodiscard]] QRect rounded(const QRectF &rect);
/// rounded() of toDesktopExactly().
[[nodiscard]] QRect toDesktop(const Rect &rect);

} // namespace penwick::platform
