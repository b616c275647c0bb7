// SPDX-License-Identifier: MIT
// A private desktop: an X server nobody else uses, and a window manager on it.
#pragma once

#include "desktop/support/ChildProcess.h"
#include "desktop/support/Keyboard.h"
#include "desktop/support/Pointer.h"
#include "desktop/support/Screen.h"
#include "desktop/support/WindowManager.h"
#include "desktop/support/Windows.h"

#include <QRect>
#include <QSize>
#include <QTemporaryDir>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace penwick::desktop {

class XConnection;

/// The whole desktop, up and managed when the constructor returns, gone after the destructor.
///
/// It takes a display number that is free, so any number of them run side by side. Home, run-time
/// and cache folders are its own and empty; a program under test finds no session bus.
class Desktop final
{
public:
    /// Throws a runtime_error with the reason when a part of it is absent or does not come up.
    explicit Desktop(
        WindowManager windowManager = chosenManager(), QSize screenSize = { 1280, 800 });
    ~Desktop();

    [[nodiscard]] const ManagerTraits &manager() const { return m_manager; }
    [[nodiscard]] const std::string &displayName() const { return m_displayName; }
    /// What a program that is to run on this desktop needs, each "NAME=value"; `variables` beside
    /// that, or instead of it.
    [[nodiscard]] std::vector<std::string> environment(
        const std::vector<std::string> &variables = {}) const;
    /// The address of the desktop's session bus, which is started when it is first asked for.
    [[nodiscard]] const std::string &sessionBus();
    /// A name for a file in the desktop's own folder.
    [[nodiscard]] std::string file(const std::string &name) const;

    /// Sees to a compositing manager: starts one, unless the window manager is one itself, and
    /// returns once there is one. Throws like the constructor.
    void startCompositor();
    void endCompositor(); ///< one that was started; returns once there is none
    /// Ends the window manager; its windows stay.
    void endWindowManager();
    /// Starts the constructor's one again and returns once it manages the windows that are there.
    void startWindowManager();
    void endSessionBus(); ///< one that was started
    /// Makes monitors of these parts of the screen, the first one the primary one, in place of
    /// those that were there.
    void splitInto(const std::vector<QRect> &monitors);

    [[nodiscard]] Pointer &pointer() { return *m_pointer; }
    [[nodiscard]] Keyboard &keyboard() { return *m_keyboard; }
    [[nodiscard]] const Screen &screen() const { return *m_screen; }
    [[nodiscard]] Windows &windows() { return *m_windows; }

private:
    void startServer(QSize screenSize);
    void startBus();

    const ManagerTraits &m_manager;
    QTemporaryDir m_folder;
    std::string m_displayName;
    std::string m_busAddress;
    std::unique_ptr<ChildProcess> m_server;
    std::unique_ptr<ChildProcess> m_bus;
    std::unique_ptr<ChildProcess> m_windowManager;
    std::unique_ptr<ChildProcess> m_compositor;
    std::unique_ptr<XConnection> m_connection;
    std::unique_ptr<Pointer> m_pointer;
    std::unique_ptr<Keyboard> m_keyboard;
    std::unique_ptr<Screen> m_screen;
    std::unique_ptr<Windows> m_windows;
};

} // namespace penwick::desktop
