// SPDX-License-Identifier: MIT
// Follows a window's outer frame on the real desktop.
// The one place where the window manager's late answers are turned into facts.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QElapsedTimer>
#include <QMargins>
#include <QObject>
#include <QRect>
#include <QTimer>
#include <QWindow>

#include <optional>

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

    [[nodiscard]] Rect frame() const;
    /// The title bar and borders, in points, as last known.
    [[nodiscard]] QMargins margins() const { return m_margins; }
    /// Asks for `frame` and returns at once. The desktop may grant something else.
    void request(const Rect &frame);
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
    void onFrameExchanged(bool hasFrame);
    void applyRequest();
    void adoptScale();
    [[nodiscard]] bool isArranged() const;
    [[nodiscard]] bool isNew() const;
    void mendToolkit();
    void check();
    [[nodiscard]] bool isDecoratedAnew() const;
    void awaitAnswer();
    void lookAgain();
    [[nodiscard]] bool isOverlooked() const;
    void announce();
    void announceRescaled(QPoint delta, bool hasResized);
    void announceUserMove();
    [[nodiscard]] QRect outerGeometry() const;
    [[nodiscard]] bool isWhereItBelongs(const QRect &outer) const;

    QWidget &m_window;
    QRectF m_frame; // Qt's desktop, which another primary screen leaves as it is
    QPoint m_origin; // of frame() in Qt's desktop, when moved() was last thought of
    QRect m_announced; // Qt's desktop; what the last signals told of
    QMargins m_margins; // of the desktop, as last used to place the window
    double m_scale = 0.0; // device pixels a point, for which m_margins hold
    bool m_isRescaled = false; // and nobody has been told
    bool m_isPending = false; // asked, not yet granted
    WId m_followed = 0;
    std::optional<QPoint> m_corner; // of the frame, in device pixels, where the desktop tells it
    // Children of this object: a test without a clock finds them there and fires them by hand.
    QTimer m_check { this };
    QTimer m_patience { this };
    int m_looksLeft = 0;
    QTimer m_userMove { this }; // runs while a move by the user may go on
    bool m_isByUser = false;
    std::optional<QRectF> m_givenUp; // what was asked for, in whose place something else stands
    bool m_isMended = false; // asked once more already
    std::optional<QRectF> m_askedBeforeFrame; // given up before the window manager had framed it
    bool m_isFrameLost = false; // the window manager has ended; m_margins are its frame's
    QElapsedTimer m_sinceFramed;
};

} // namespace penwick::platform
