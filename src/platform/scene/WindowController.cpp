// SPDX-License-Identifier: MIT
#include <penwick/platform/WindowController.h>

#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WindowFlags.h"

#include <utility>

namespace penwick::platform {

WindowController::WindowController()
{
    requireApplication();
}

WindowController::~WindowController()
{
    requireGuiThreadAtEnd();
}

WindowController::WindowController(std::unique_ptr<Window> window)
    : WindowController()
{
    m_window = std::move(window);
    if (m_window)
        contentOf(*m_window).setResponder(this);
}

Window *WindowController::window() const
{
    requireGuiThread();
    return m_window.get();
}

void WindowController::setWindow(std::unique_ptr<Window> window)
{
    requireGuiThread();
    m_window = std::move(window);
    contentOf(*m_window).setResponder(this);
    windowDidLoad();
}

void WindowController::showWindow(QObject *)
{
    requireGuiThread();
    if (!m_window)
        return;
    m_window->orderFront();
    if (canBecomeKey(m_window->attributes()))
        m_window->activateWindow();
}

void WindowController::windowDidLoad()
{
    requireGuiThread();
}

void WindowController::mouseDown()
{
    requireGuiThread();
}

void WindowController::mouseUp()
{
    requireGuiThread();
}

bool WindowController::keyDown(const QKeyEvent &)
{
    requireGuiThread();
    return false;
}

void WindowController::retire()
{
    requireGuiThread();
    if (m_window)
        m_window->orderOut();
}

} // namespace penwick::platform
