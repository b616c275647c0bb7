// SPDX-License-Identifier: MIT
// Moves a window with the pointer.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QPoint>

#include <optional>

namespace penwick::platform {

/// One drag of a window by its background. The pointer is in Qt's desktop coordinates, y down.
class BackgroundDrag
{
public:
    /// Takes hold of a window that has `frame`.
    void begin(const Rect &frame, QPoint pointer);
    /// Where the window that has `frame` is to go; nothing while it is not held.
    [[nodiscard]] std::optional<Rect> moved(const Rect &frame, QPoint pointer) const;
    void end() { m_grab.reset(); }

private:
    std::optional<QPoint> m_grab; // from the window's top left corner
};

} // namespace penwick::platform
