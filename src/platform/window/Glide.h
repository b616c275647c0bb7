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

    [[nodiscard]] bool isUnderWay() const { return m_at.has_value(); }
    /// Sets off from where the window is seen now, in place of a movement under way.
    void start(const Rect &target);
    /// Leaves the window where it is seen now, which is its frame then. For who takes hold of it.
    void halt();
    /// Forgets the way, for who asks for another frame.
    void stop();

private:
    FrameTracker &m_tracker;
    std::optional<Rect> m_at; // while it is under way
    QPointer<QVariantAnimation> m_animation;
};

} // namespace penwick::platform
