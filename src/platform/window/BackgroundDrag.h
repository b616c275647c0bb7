// SPDX-License-Identifier: MIT
// Moves a window with the pointer.
#pragma once

#include <QPoint>

#include <optional>

namespace penwick::platform {

class Window;

/// One drag of a window by its background. Places are in Qt's desktop coordinates, y down.
class BackgroundDrag
{
public:
    /// Takes hold at `pointer`, if the window's attributes let it be moved that way.
    void begin(const Window &window, QPoint pointer);
    void goOn(Window &window, QPoint pointer) const;
    void end() { m_grab.reset(); }

private:
    std::optional<QPoint> m_grab; // from the window's top left corner
};

} // namespace penwick::platform
