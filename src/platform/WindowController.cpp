// SPDX-License-Identifier: MIT
#include <penwick/platform/WindowController.h>

#include <penwick/platform/Window.h>

#include "platform/WindowFlags.h"

#include <utility>

namespace penwick::platform {

WindowController::WindowController() = default;
WindowController::~WindowController() = default;

WindowController::WindowController(std::unique_ptr<Window> window)
    : m_window(std::move(window))
{
    if (m_window)
        m_window->setWindowController(this);
}

Window *WindowController::window() const
{
    return m_window.get();
}

void WindowController::setWindow(std::unique_ptr<Window> window)
{
    m_window = std::move(window);
    m_window->setWindowController(this);
    windowDidLoad();
}

void WindowController::showWindow(QObject *)
{
    if (!m_window)
        return;
    m_window->orderFront();
    if (canBecomeKey(m_window->attributes()))
        m_window->activateWindow();
}

bool WindowController::keyDown(const QKeyEvent &)
{
    return false;
}

void WindowController::retire()
{
    if (m_window)
        m_window->orderOut();
}

} // namespace penwick::platform
