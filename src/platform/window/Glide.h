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
    /// Ends the movement where the window is seen now, and asks for that place as its frame; for a
    /// user who takes hold of the window.
    void halt();
    /// Ends the movement and asks for nothing; for a caller who then asks for another frame.
    void stop();

private:
    FrameTracker &m_tracker;
    std::optional<Rect> m_at; // while it is under way
    QPointer<QVariantAnimation> m_animation;
};

} // namespace penwick::platform
