// SPDX-License-Identifier: MIT
#include "desktop/support/Desktop.h"

#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <QDir>
#include <QFile>

#include <array>
#include <cstdlib>
#include <stdexcept>

namespace penwick::desktop {

namespace {

// What passes from the test's own surroundings; everything else could make two runs differ.
constexpr std::array passedOn { "PATH", "LD_LIBRARY_PATH", "TMPDIR", "ASAN_OPTIONS",
    "UBSAN_OPTIONS", "LSAN_OPTIONS" };

} // namespace

Desktop::Desktop(WindowManager windowManager, QSize screenSize)
    : m_manager(traitsOf(windowManager))
{
    if (!m_folder.isValid())
        throw std::runtime_error("no temporary folder: " + m_folder.errorString().toStdString());
    for (const char *name : { "home", "run" }) {
        const QString path = m_folder.filePath(QLatin1String(name));
        QDir().mkdir(path);
        QFile::setPermissions(path, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    startServer(screenSize);
    m_connection = std::make_unique<XConnection>(m_displayName);
    m_pointer = std::make_unique<Pointer>(*m_connection);
    m_keyboard = std::make_unique<Keyboard>(*m_connection);
    m_screen = std::make_unique<Screen>(*m_connection);
    m_windows = std::make_unique<Windows>(*m_connection,
        m_manager.hasInvisibleBorders ? FrameBorders::PartlyInvisible : FrameBorders::Visible);
    startWindowManager();
}

Desktop::~Desktop()
{
    // The server last: a client that loses its server complains.
    m_compositor.reset();
    m_windowManager.reset();
    m_bus.reset();
    m_connection.reset();
    m_server.reset();
}

std::vector<std::string> Desktop::environment(const std::vector<std::string> &variables) const
{
    std::vector<std::string> all {
        "HOME=" + file("home"),
        "XDG_RUNTIME_DIR=" + file("run"),
        "LANG=C.UTF-8",
        // The address of a bus that does not exist: without any address a program would start a
        // bus, which would stay.
        "DBUS_SESSION_BUS_ADDRESS=unix:path=" + file("no-bus"),
        "NO_AT_BRIDGE=1",
    };
    if (!m_displayName.empty())
        all.push_back("DISPLAY=" + m_displayName);
    for (const char *name : passedOn) {
        if (const char *const value = std::getenv(name))
            all.push_back(std::string(name) + '=' + value);
    }
    for (const std::string &variable : variables) {
        // If a variable were there twice, the first would count.
        const std::string name = variable.substr(0, variable.find('=') + 1);
        std::erase_if(all, [&name](const std::string &other) { return other.starts_with(name); });
        all.push_back(variable);
    }
    return all;
}

std::string Desktop::file(const std::string &name) const
{
    return m_folder.filePath(QString::fromStdString(name)).toStdString();
}

void Desktop::startServer(QSize screenSize)
{
    const std::string size
        = std::to_string(screenSize.width()) + 'x' + std::to_string(screenSize.height()) + "x24";
    std::vector<std::string> command { "Xvfb", "-displayfd", "1", "-screen", "0", size, "-dpi",
        "96", "-nolisten", "tcp", "-noreset" };
    command.insert(
        command.end(), m_manager.serverArguments.begin(), m_manager.serverArguments.end());
    m_server = std::make_unique<ChildProcess>(
        ChildProcess::Command { command, environment(), file("Xvfb.log") });
    std::optional<std::string> number;
    require([&] { return (number = m_server->takeLine()) || m_server->exitStatus(); },
        "the X server to say its display number");
    if (!number)
        throw std::runtime_error("the X server ended at once");
    m_displayName = ':' + *number;
}

void Desktop::startCompositor()
{
    if (m_manager.composes)
        return; // there can be one only
    // No settings of anybody's: a shadow or a fading window would change the pixels.
    m_compositor = std::make_unique<ChildProcess>(
        ChildProcess::Command { { "picom", "--config", "/dev/null", "--backend", "xrender" },
            environment(), file("compositor.log") });
    require(
        [this] {
            return m_compositor->exitStatus() || m_connection->hasSelectionOwner("_NET_WM_CM_S0");
        },
        "a compositing manager");
    if (m_compositor->exitStatus())
        throw std::runtime_error("picom ended at once");
}

void Desktop::endCompositor()
{
    m_compositor.reset();
    require([this] { return !m_connection->hasSelectionOwner("_NET_WM_CM_S0"); },
        "the compositing manager to be gone");
}

void Desktop::splitInto(const std::vector<QRect> &monitors)
{
    m_connection->setMonitors(monitors);
}

const std::string &Desktop::sessionBus()
{
    if (!m_bus)
        startBus();
    return m_busAddress;
}

void Desktop::startBus()
{
    m_bus = std::make_unique<ChildProcess>(
        ChildProcess::Command { { "dbus-daemon", "--session", "--nofork", "--nopidfile",
                                    "--print-address=1", "--address=unix:path=" + file("bus") },
            environment(), file("bus.log") });
    std::optional<std::string> address;
    require([&] { return (address = m_bus->takeLine()) || m_bus->exitStatus(); },
        "the session bus to say its address");
    if (!address)
        throw std::runtime_error("the session bus ended at once");
    m_busAddress = *address;
}

void Desktop::endSessionBus()
{
    m_bus.reset();
}

void Desktop::endWindowManager()
{
    m_connection->forgetWindowManager();
    m_windowManager.reset();
    require([this] { return !m_windows->areManaged(); }, "the window manager to be gone");
}

void Desktop::startWindowManager()
{
    if (m_manager.command.empty())
        return;
    std::vector<std::string> variables = m_manager.environment;
    if (m_manager.needsBus)
        variables.push_back("DBUS_SESSION_BUS_ADDRESS=" + sessionBus());
    m_windowManager = std::make_unique<ChildProcess>(ChildProcess::Command {
        m_manager.command, environment(variables), file("window-manager.log") });

    const auto hasComeUp = [this] {
        return m_windows->areManaged()
            && (!m_manager.composes || m_connection->hasSelectionOwner("_NET_WM_CM_S0"));
    };
    require([&] { return m_windowManager->exitStatus() || hasComeUp(); },
        m_manager.name + " to manage the display");
    if (m_windowManager->exitStatus())
        throw std::runtime_error(m_manager.name + " ended at once");
    m_connection->awaitWindowManager(
        m_windows->canTellFrames() ? ProbeWith::FrameQuestion : ProbeWith::SelectionQuestion);
}

} // namespace penwick::desktop
