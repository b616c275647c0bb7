// SPDX-License-Identifier: MIT
// Follows a window's outer frame on the real desktop.
// The one place where the window manager's late answers are turned into facts.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QMargins>
#include <QObject>
#include <QRect>
#include <QTimer>

class QWidget;

namespace penwick::platform {

/// Asks for a window's outer frame and reports where the window really stands.
///
/// Frames are in points, y up, from the primary screen's bottom left corner. A decorated window
/// has no true frame until the desktop has answered, which may be after the first paint; until
/// then frame() is what was asked. GUI thread only.
class FrameTracker final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `window`, which owns this object.
    explicit FrameTracker(QWidget &window);
    ~FrameTracker() override;

    [[nodiscard]] Rect frame() const;
    /// Asks for `frame` and returns at once. The desktop may grant something else.
    void request(const Rect &frame);
    /// Places the window, which is about to be shown, so that its outer frame is right at once.
    void prepareToShow();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// The window has another size than when this was last sent, or than when it was shown. Sent
    /// before moved() where both changed.
    void resized();
    /// The window was moved by `delta` of Qt's desktop and kept its size. Sent before moved().
    void shifted(QPoint delta);
    /// The window's top left corner is somewhere else.
    void moved();

private:
    void applyRequest();
    void check();
    [[nodiscard]] bool isDecoratedAnew() const;
    void awaitAnswer();
    void lookAgain();
    void announce();
    [[nodiscard]] QRect outerGeometry() const;

    QWidget &m_window;
    Rect m_frame;
    QRect m_announced; // Qt's desktop; what the last signals told of
    QMargins m_margins; // of the desktop, as last used to place the window
    bool m_isPending = false; // asked, not yet granted
    QTimer m_check;
    QTimer m_patience;
    int m_looksLeft = 0;
};

} // namespace penwick::platform
