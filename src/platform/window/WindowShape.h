// SPDX-License-Identifier: MIT
// Keeps a window's shape while the user resizes it, or its size where the user may not.
#pragma once

#include <penwick/platform/Geometry.h>

#include "platform/foundation/Clock.h"

#include <QObject>

namespace penwick::platform {

class FrameTracker;

/// Asks the desktop to keep a window's aspect ratio, while the window's frame has it. Where the
/// desktop does not, and the user has given the frame another shape, the frame is to be corrected.
class WindowShape final : public QObject
{
    Q_OBJECT

public:
    /// Borrows both; `tracker` follows `window` and owns this object.
    WindowShape(QWidget &window, FrameTracker &tracker);

    /// The width and height of the shape to be kept; nothing leaves the window alone.
    void setRatio(const std::optional<Size> &ratio) { m_ratio = ratio; }
    /// Whether the user may resize the window at all. Where not, the desktop is told that the size
    /// that was asked for is the only one.
    void setResizable(bool isResizable);

Q_SIGNALS:
    /// The window is to have `frame` instead of the one that its user has given it.
    void corrected(const penwick::platform::Rect &frame);

private:
    void keep(const QSize &content);
    void await(bool isPulled);
    void awaitRest();
    void rest();
    void correct();
    void rememberFrame();
    [[nodiscard]] Rect shaped(const Rect &changed, const Size &ratio) const;
    [[nodiscard]] bool isArranged() const;

    QWidget &m_window;
    FrameTracker &m_tracker;
    std::optional<Size> m_ratio;
    bool m_isResizable = true;
    Rect m_before; // the frame that the user began to pull; empty before the first one
    bool m_isPulled = false; // by the user; otherwise the desktop has chosen another size
    bool m_isByHand = false; // the pointer was held during the pull
    bool m_isAnswering = false; // the desktop has still to answer a correction
    Alarm m_rest { Clock::ofTheUser(), this }; // set while the user may still be pulling
};

} // namespace penwick::platform
