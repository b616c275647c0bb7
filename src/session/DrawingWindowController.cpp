// SPDX-License-Identifier: MIT
#include <penwick/DrawingWindowController.h>

#include "appearance/Theme.h"
#include "appearance/ViewBorder.h"
#include "platform/View.h"
#include "platform/foundation/FatalError.h"

#include <penwick/Penwick.h>
#include <penwick/platform/NotificationCenter.h>

#include <QCoreApplication>
#include <QGuiApplication>
#include <QScreen>

namespace penwick {

namespace {

using platform::Animate;
using platform::Rect;
using platform::require;

constexpr double boardBorder = 3.0; // points

Rect mainScreenFrame()
{
    return platform::frameOfScreen(
        *require(QGuiApplication::primaryScreen(), "there is no main screen"));
}

// A 16:9 box of `width`, one sixth of the screen away from the screen's bottom left corner.
Rect boardOn(const Rect &screen, double width)
{
    return { screen.x + screen.width / 6, screen.y + screen.height / 6, width, width * 9 * 0.0625 };
}

} // namespace

DrawingWindowController::DrawingWindowController()
    : m_minWindowWidth(mainScreenFrame().width * 2 / 3)
    , m_minWindowHeight(mainScreenFrame().height * 2 / 3)
{ }

DrawingWindowController::~DrawingWindowController() = default;

std::optional<platform::Point> DrawingWindowController::drawingWindowOrigin() const
{
    return m_drawingWindowOrigin;
}

std::optional<WindowType> DrawingWindowController::mWindowType() const
{
    return m_windowType;
}

platform::Window *DrawingWindowController::drawingWindow() const
{
    return m_drawingWindow;
}

void DrawingWindowController::setDrawingWindow(platform::Window *window)
{
    m_drawingWindow = window;
}

double DrawingWindowController::minWindowWidth() const
{
    return m_minWindowWidth;
}

double DrawingWindowController::minWindowHeight() const
{
    return m_minWindowHeight;
}

void DrawingWindowController::windowDidLoad()
{
    WindowController::windowDidLoad();
    platform::Window &window = *require(m_drawingWindow.data(), "the drawing window is gone");
    platform::WindowAttributes attributes = window.attributes();
    attributes.backgroundColor = Qt::white;
    attributes.styleMask |= platform::StyleMask::resizable;
    attributes.hasShadow = true;
    attributes.aspectRatio = platform::Size { 16.0, 9.0 };
    window.setAttributes(attributes);
    // The host's own translations; no context, because the title is the host's to word.
    window.setWindowTitle(QCoreApplication::translate("", "Tarnhill Whiteboard"));
    window.setFrame(boardOn(mainScreenFrame(), m_minWindowWidth), Animate::Yes);
}

void DrawingWindowController::createWindowForApplication(WindowType win_type, QScreen &screen,
    const std::optional<QImage> &, const std::optional<QString> &)
{
    m_windowType = win_type;
    const Rect screenFrame = platform::frameOfScreen(screen);
    m_minWindowWidth = screenFrame.width * 2 / 3;
    m_minWindowHeight = screenFrame.height * 2 / 3;
    platform::Window &window = *require(m_drawingWindow.data(), "the drawing window is gone");
    if (win_type == WindowType::whiteboard)
        placeOnWhiteboard(screen);
    m_drawingWindowOrigin = window.frame().origin();
}

void DrawingWindowController::placeOnWhiteboard(const QScreen &screen)
{
    platform::View &canvas
        = *require(m_drawingWindow->contentView(), "the drawing window has no content view");
    setViewBorder(canvas, TnhColors::borderGreenColor, boardBorder, 0.0);
    m_drawingWindow->setFrame(
        boardOn(platform::frameOfScreen(screen), m_minWindowWidth), Animate::Yes);
}

void DrawingWindowController::windowDidMove()
{
    if (m_drawingWindow)
        m_drawingWindowOrigin = m_drawingWindow->frame().origin();
}

void DrawingWindowController::windowWillClose()
{
    platform::NotificationCenter::defaultCenter().postNotification(
        penwickSessionEndNotificationKey(), m_windowType == WindowType::imageAnnotation);
}

} // namespace penwick
