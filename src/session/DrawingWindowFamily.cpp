// SPDX-License-Identifier: MIT
// How a drawing window and the windows above it (tool bar, popover and banner) move, appear and
// close together.
#include <penwick/DrawingWindowController.h>

#include "canvas/DrawingCanvasView.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/GuiThread.h"
#include "platform/foundation/KeptShape.h"
#include "platform/foundation/OneShotTimer.h"
#include "platform/foundation/StandardOutput.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WorkArea.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <penwick/Penwick.h>
#include <penwick/platform/NotificationCenter.h>

#include <QScreen>

namespace penwick {

namespace {

using platform::Rect;
using platform::require;

constexpr int bannerTime = 1500; // ms
constexpr double toolBarInset = 20.0; // points, from the drawing window's left edge
constexpr auto missingToolBar = "Warning: ToolPanelWindowController not created!";

} // namespace

// The tool bar

void DrawingWindowController::placeToolBar()
{
    if (!m_tPanelWindowController) {
        platform::printLine(missingToolBar);
        return;
    }
    platform::Window *const panel = m_tPanelWindowController->window();
    if (!panel)
        return;
    setWindowPositionRelativeToMainWindow(
        *panel, toolBarInset, m_drawingWindow->frame().height * 0.5 - panel->frame().height * 0.5);
    platform::WindowAttributes attributes = panel->attributes();
    attributes.hasShadow = true;
    panel->setAttributes(attributes);
    m_tPanelWindowController->takeItsPlace();
    m_tPanelWindowController->showWindow(this);
}

void DrawingWindowController::takeToolBarAlong(platform::Point way)
{
    platform::Window *const panel
        = m_tPanelWindowController ? m_tPanelWindowController->window() : nullptr;
    if (panel)
        panel->setFrameOrigin(panel->frame().origin() + way);
}

// A tool bar that appears disables undo and redo. Here the drawing is still there, so both buttons
// get back the state that they had.
void DrawingWindowController::reopenToolBar()
{
    ToolPanelViewController &bar = m_tPanelWindowController->content();
    ToolPanelButton &undo = *bar.button(QStringLiteral("undo"));
    ToolPanelButton &redo = *bar.button(QStringLiteral("redo"));
    const bool canUndo = undo.isEnabled();
    const bool canRedo = redo.isEnabled();
    m_tPanelWindowController->showWindow(this);
    undo.setEnabled(canUndo);
    redo.setEnabled(canRedo);
}

void DrawingWindowController::setWindowPositionRelativeToMainWindow(
    platform::Window &window, double xoffset, double yOffset)
{
    platform::requireGuiThread();
    if (!m_drawingWindowOrigin)
        platform::fatalError("the drawing window has not been placed");
    window.setFrameOrigin(*m_drawingWindowOrigin + platform::Point { xoffset, yOffset });
}

// The banner

void DrawingWindowController::setNotificationWindowProperties(platform::Window &window)
{
    platform::requireGuiThread();
    platform::WindowAttributes attributes = window.attributes();
    attributes.isOpaque = false;
    attributes.sharingType = platform::SharingType::none;
    attributes.titlebarAppearsTransparent = true;
    attributes.backgroundColor = Qt::transparent;
    window.setAttributes(attributes);
}

void DrawingWindowController::centreBanner()
{
    const platform::Size drawing = m_drawingWindow->frame().size();
    const platform::Size banner = m_sharingNotificationWindow->frame().size();
    setWindowPositionRelativeToMainWindow(*m_sharingNotificationWindow,
        drawing.width * 0.5 - banner.width * 0.5, drawing.height * 0.5 - banner.height * 0.5);
}

void DrawingWindowController::showSharingNotificationWindow()
{
    platform::requireGuiThread();
    if (!m_sharingNotificationWindow)
        return;
    require(m_drawingWindow.data(), "the drawing window is gone");
    centreBanner();
    m_drawingWindow->addChildWindow(*m_sharingNotificationWindow);
    m_sharingNotificationWindow->orderFront(); // now, or once the drawing window is shown
    platform::callLater(
        *this, bannerTime, &DrawingWindowController::closeSharingNotificationWindow);
}

void DrawingWindowController::closeSharingNotificationWindow()
{
    platform::requireGuiThread();
    if (!m_sharingNotificationWindow)
        return;
    m_sharingNotificationWindow->orderOut();
    m_sharingNotificationWindow->close();
}

// Appearing, moving, resizing, closing

// Brings an image's window onto the screen, as a desktop does with a window that it shows. The
// windows above it go along. If the window has to become smaller, the tool bar is placed anew.
void DrawingWindowController::bringPictureInside()
{
    if (m_windowType != WindowType::imageAnnotation || !m_isPlaced || !m_drawingWindow)
        return;
    const Rect frame = m_drawingWindow->frame();
    const Rect screen = platform::frameOfScreen(*m_drawingWindow->screen());
    const Rect inside = platform::broughtInsideInShape(frame, platform::workAreaFor(screen));
    if (inside == frame)
        return;
    hideThePopover();
    m_drawingWindow->setFrame(inside);
    m_drawingWindowOrigin = inside.origin();
    if (inside.size() == frame.size()) {
        takeToolBarAlong(inside.origin() - frame.origin());
        if (m_tPanelWindowController)
            m_tPanelWindowController->keepEndInReach(); // nobody tells that a hidden window moved
    } else {
        placeToolBar();
    }
    if (m_sharingNotificationWindow && m_sharingNotificationWindow->parentWindow())
        centreBanner();
}

void DrawingWindowController::windowWillAppear()
{
    platform::requireGuiThread();
    bringPictureInside();
    if (m_isPlaced && m_tPanelWindowController && m_tPanelWindowController->toolPanelWindow())
        reopenToolBar();
}

void DrawingWindowController::windowDidMove()
{
    platform::requireGuiThread();
    if (m_drawingWindow)
        m_drawingWindowOrigin = m_drawingWindow->frame().origin();
    if (m_tPanelWindowController)
        m_tPanelWindowController->keepEndInReach(); // the panel moved with the window
}

void DrawingWindowController::windowDidResize()
{
    platform::requireGuiThread();
    platform::Window *const panel
        = m_tPanelWindowController ? m_tPanelWindowController->window() : nullptr;
    if (!panel) {
        platform::printLine(missingToolBar);
        return;
    }
    if (!m_drawingWindowOrigin || !m_drawingWindow)
        return;
    const platform::Point origin = m_drawingWindow->frame().origin();
    takeToolBarAlong(origin - *m_drawingWindowOrigin);
    m_tPanelWindowController->adjustPosition();
    m_drawingWindowOrigin = origin;
}

void DrawingWindowController::windowWillMove()
{
    platform::requireGuiThread();
    hideThePopover();
}

void DrawingWindowController::windowDidResignMain()
{
    platform::requireGuiThread();
    hideThePopover();
}

void DrawingWindowController::hideThePopover()
{
    platform::requireGuiThread();
    if (!m_drawingWindow)
        return;
    auto *const canvas
        = dynamic_cast<DrawingCanvasView *>(platform::contentOf(*m_drawingWindow).contentView());
    if (canvas && canvas->popoverWindow())
        canvas->popoverWindow()->orderOut();
}

bool DrawingWindowController::keyDown(const QKeyEvent &event)
{
    platform::requireGuiThread();
    return m_tPanelWindowController && m_tPanelWindowController->content().performKey(event);
}

void DrawingWindowController::windowWillClose()
{
    platform::requireGuiThread();
    if (m_tPanelWindowController && m_tPanelWindowController->toolPanelWindow())
        m_tPanelWindowController->toolPanelWindow()->close();
    platform::NotificationCenter::defaultCenter().postNotification(
        penwickSessionEndNotificationKey(), m_windowType == WindowType::imageAnnotation);
}

} // namespace penwick
