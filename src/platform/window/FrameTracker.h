// SPDX-License-Identifier: MIT
// Follows a window's outer frame on the real desktop: the toolkit's events and the desktop's words
// into the negotiation, and what comes out of it to the toolkit and to whoever listens.
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
/// then frame() is what was asked. While the window manager that has framed a window is gone, the
/// frame counts as if it were still there, since the next one puts one there. GUI thread only.
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
    /// The window on the screen sets off to `target`. Whoever follows it is told here that it is
    /// there, and of the steps nothing; a request ends the way.
    void setOff(const Rect &target);
    /// The next place on the way.
    void step(const Rect &frame);
    /// Places the window, which is about to be shown, so that its outer frame is right at once.
    void prepareToShow();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// The desktop is about to be asked for frame(), with margins() around the content.
    void asking();
    /// The window has another size than when this was last sent, or than when it was shown. Sent
    /// before moved() where both changed.
    void resized();
    /// The user has begun to move the window. Sent before shifted(), once for each move however
    /// many steps it has.
    void moveBegan();
    /// The window was moved by `delta` of Qt's desktop and kept its size, or has come to a screen
    /// of another scale. Sent before moved().
    void shifted(QPoint delta);
    /// The same, because the user pulled at its edges. Sent after resized().
    void resizedByUser();
    /// The same, because the desktop has made another size of `asked`.
    void resizedByDesktop(const penwick::platform::Rect &asked);
    /// The desktop has granted the frame that was asked for, or put a frame of its own around the
    /// window in the same place.
    void confirmed();
    /// The window's top left corner is somewhere else, on the desktop or from the primary screen.
    void moved();
    /// Nothing is open: the frame is what stands on the screen. Sent after all others.
    void settled();
    /// The window has come to a screen with another number of device pixels a point. Sent before
    /// all others, of which shifted() and moved() come before resized() then.
    void rescaled();

private:
    void followPrimaryScreen();
    void followFrame();
    void lookSoon();
    void look();
    void awaitNextLook();
    void carryOut(const FrameEffects &effects);
    void place(const FramePlacing &placing);
    void tell(const FrameNews &news);
    [[nodiscard]] FrameObservation observation() const;

    QWidget &m_window;
    FrameNegotiation m_negotiation;
    WId m_followed = 0;
    Alarm m_alarm; // for the next look
};

} // namespace penwick::platform
