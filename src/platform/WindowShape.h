// SPDX-License-Identifier: MIT
// Keeps a window's shape while the user resizes it.
#pragma once

#include <QObject>
#include <QTimer>

namespace penwick::platform {

class FrameTracker;
class Window;

/// Has the desktop keep the aspect ratio of a window's attributes, where the window's frame has
/// it, and brings a frame that the user gave another one back to it, where the desktop did not.
/// A window that the user cannot resize is left alone.
class WindowShape final : public QObject
{
    Q_OBJECT

public:
    /// Borrows both; `tracker` follows `window` and owns this object.
    WindowShape(Window &window, FrameTracker &tracker);

    /// Tells the desktop anew; called before a new frame is asked for and after it was granted.
    void update();

private:
    void correct();
    [[nodiscard]] bool isKept() const;

    Window &m_window;
    FrameTracker &m_tracker;
    QTimer m_rest { this }; // runs while the user may still be pulling
};

} // namespace penwick::platform
