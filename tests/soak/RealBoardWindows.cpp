// SPDX-License-Identifier: MIT
// The component's windows: shown, hidden, moved, and told what a desktop tells.
#include "soak/RealBoard.h"

#include "platform/foundation/Clock.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QApplication>
#include <QWindow>

namespace penwick::test {

namespace {

// After this time the component has been granted its request, or takes what is there for the
// answer.
constexpr platform::Clock::Time patience { 300 };
// After this time a user's move, or pull at an edge, counts as over.
constexpr platform::Clock::Time longestRest { 1000 };

/// While it lives, a window does not hear that it is, or is not any more, the active one.
class Deaf final : public QObject
{
public:
    explicit Deaf(QWidget &window) { window.installEventFilter(this); }
    bool eventFilter(QObject *, QEvent *event) override
    {
        return event->type() == QEvent::ActivationChange;
    }
};

} // namespace

void RealBoard::paint()
{
    // Painted twice: what came to the canvas while it was painted is painted the second time.
    for (int pass = 0; pass < 2; ++pass) {
        QEvent update(QEvent::UpdateRequest);
        QCoreApplication::sendEvent(&window(), &update);
    }
}

void RealBoard::activate(bool isActive)
{
    // This call is deprecated, but it acts at once. The one that replaces it asks the desktop,
    // whose answer comes with the event loop: the board would paint, and do what it left for later,
    // before it lost the keys.
    QT_WARNING_PUSH
    QT_WARNING_DISABLE_DEPRECATED
    QApplication::setActiveWindow(isActive ? &window() : nullptr);
    QT_WARNING_POP
}

void RealBoard::minimise(bool isMinimised)
{
    // A desktop may bring it back elsewhere, which goes on with no earlier move.
    platform::Clock::ofTheDesktop().letPass(longestRest);
    window().setWindowState(isMinimised ? Qt::WindowMinimized : Qt::WindowNoState);
    m_held = {};
    if (isMinimised)
        return;
    hearDesktop(); // that it was minimised, too
    turn();
}

void RealBoard::hide()
{
    window().hide();
    m_held = {}; // what is let go over a window that is gone is not heard of
}

void RealBoard::show()
{
    platform::Clock::ofTheDesktop().letPass(longestRest);
    {
        const Deaf deaf(window()); // it becomes active as it is shown
        m_controller->showWindow(nullptr);
        hearDesktop();
    }
    activate(false);
    activate(true);
    turn();
}

void RealBoard::close()
{
    window().windowHandle()->close(); // as the title bar's button does
}

void RealBoard::showBanner(bool isShown)
{
    if (isShown)
        m_penwick->showWindowSharingNotification();
    else
        m_controller->closeSharingNotificationWindow(); // what the timer does later
}

void RealBoard::turn()
{
    QCoreApplication::sendPostedEvents();
    paint();
}

// What the user does to it on the desktop

QRect RealBoard::outerFrame() const
{
    return window().windowHandle()->frameGeometry();
}

void RealBoard::moveTo(const QRect &outer)
{
    platform::Clock::ofTheDesktop().letPass(longestRest); // each is a move of its own
    QWindow &native = *window().windowHandle();
    native.setGeometry(outer.marginsRemoved(native.frameMargins()));
    hearDesktop();
    turn();
}

void RealBoard::rest()
{
    platform::Clock::ofTheUser().letPass(longestRest);
    platform::Clock::ofTheDesktop().letPass(longestRest);
    hearDesktop();
    turn();
}

void RealBoard::hearDesktop()
{
    {
        // Without a screen every window that came up since becomes the active one.
        const bool isActive = window().isActiveWindow();
        const Deaf deaf(window());
        QCoreApplication::processEvents(QEventLoop::X11ExcludeTimers);
        activate(isActive);
    }
    platform::Clock::ofTheDesktop().letPass(patience);
}

PlainFrames RealBoard::frames() const
{
    const auto plain = [](const platform::Rect &frame) {
        return PlainFrame { frame.x, frame.y, frame.width, frame.height };
    };
    PlainFrames frames;
    frames.board = plain(window().frame());
    frames.panel = plain(m_controller->tPanelWindowController()->window()->frame());
    return frames;
}

} // namespace penwick::test
