// SPDX-License-Identifier: MIT
// Moves a window to its new frame over a short time.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QObject>
#include <QPointer>

#include <optional>

class QVariantAnimation;

namespace penwick::platform {

class FrameTracker;

/// One movement of a window at a time. Nothing runs while there is none.
class Glide final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `tracker`, whose child this is.
    explicit Glide(FrameTracker &tracker);

    /// Where the window is going; nothing while it stands.
    [[nodiscard]] std::optional<Rect> target() const { return m_target; }
    /// Sets off from where the window is now, in place of a movement under way.
    void start(const Rect &target);
    /// Leaves the window where it is.
    void stop();

private:
    FrameTracker &m_tracker;
    std::optional<Rect> m_target;
    QPointer<QVariantAnimation> m_animation;
};

} // namespace penwick::platform
