// SPDX-License-Identifier: MIT
// Follows a window's outer frame on the real desktop. It hands the toolkit's events and what the
// desktop says to the FrameNegotiation, and carries out and reports what comes of it.
#pragma once

#include <penwick/platform/Geometry.h>

#include "platform/foundation/Clock.h"
#include "platform/window/FrameNegotiation.h"

#include <QObject>
#include <QWindow>

class QWidget;

namespace penwick::platform {

/// Asks for a window's outer frame and reports where the window really stands.
///
/// Frames are in points, y up, from the primary screen's bottom left corner. A decorated window
/// has no true frame until the desktop has answered, which may be after the first paint; until
/// then frame() is what was asked. While there is no window manager, the frame that the last one
/// put around the window counts as if it were still there, because the next one will put one there.
/// GUI thread only.
class FrameTracker final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `window`, which owns this object.
    explicit FrameTracker(QWidget &window);
    ~FrameTracker() override;

    /// Where the window is, was asked to be, or is gliding to.
    [[nodiscard]] Rect frame() const;
    /// The title bar and borders, in points, as last known.
    [[nodiscard]] QMargins margins() const { return m_negotiation.margins(); }
    /// Asks for `frame` and returns at once. The desktop may grant something else.
    void request(const Rect &frame);
    /// The window on the screen begins to glide to `target`. Listeners are told at once that it is
    /// there, and nothing of its steps. request() ends the glide.
    void setOff(const Rect &target);
    /// Moves the gliding window on to `frame`.
    void step(const Rect &frame);
    /// Places the window, which is about to be shown, so that its outer frame is right at once.
    void prepareToShow();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// The desktop is about to be asked to put the content, without margins(), at `content`, in
    /// Qt's desktop: for frame(), or for the next step of a glide to it.
    void asking(const QRect &content);
    /// The window has another size than when this was last sent, or than when it was shown. Sent
    /// before moved() where both changed.
    void resized();
    /// The user has begun to move the window. Sent before shifted(), once for each move however
    /// many steps it has.
    void moveBegan();
    /// The window was moved by `delta` of Qt's desktop and kept its size, or has come to a screen
    /// of another scale. Sent before moved().
    void shifted(QPoint delta);
    /// The window was resized because the user pulled at its edges. Sent after resized().
    void resizedByUser();
    /// The window was resized because the desktop gave it another size than `asked`. Sent after
    /// resized().
    void resizedByDesktop(const penwick::platform::Rect &asked);
    /// The desktop has granted the frame that was asked for, or put a frame of its own around the
    /// window in the same place.
    void confirmed();
    /// The window's top left corner has moved, or the primary screen that it is counted from.
    void moved();
    /// Nothing is awaited: the frame is what is on the screen. Sent after all others.
    void settled();
    /// The window has come to a screen with another number of device pixels a point. Sent before
    /// all others; shifted() and moved() are then sent before resized().
    void rescaled();

private:
    void followPrimaryScreen();
    void followFrame();
    void lookSoon();
    void look();
    void doubt();
    void awaitNextLook();
    void carryOut(const FrameEffects &effects);
    void place(const FramePlacing &placing);
    void tell(const FrameNews &news);
    [[nodiscard]] FrameObservation observation() const;

    QWidget &m_window;
    FrameNegotiation m_negotiation;
    WId m_followed = 0;
    Alarm m_alarm; // for the next look
    Alarm m_doubt; // when it may be doubted that the desktop has done what it was asked last
};

} // namespace penwick::platform
