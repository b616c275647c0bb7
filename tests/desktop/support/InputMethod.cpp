// SPDX-License-Identifier: MIT
#include "desktop/support/InputMethod.h"

#include "desktop/support/Desktop.h"
#include "desktop/support/WaitUntil.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <stdexcept>

namespace penwick::desktop {

namespace {

// The panel chooses the engine as it comes up. The engine begins with Latin letters unless it is
// told otherwise.
constexpr const char *ibusSettings = "[desktop/ibus/general]\n"
                                     "preload-engines=['anthy']\n"
                                     "[org/freedesktop/ibus/engine/anthy/common]\n"
                                     "input-mode=0\n";

constexpr const char *fcitxGroups = "[Groups/0]\n"
                                    "Name=Default\n"
                                    "Default Layout=us\n"
                                    "DefaultIM=anthy\n"
                                    "[Groups/0/Items/0]\n"
                                    "Name=keyboard-us\n"
                                    "[Groups/0/Items/1]\n"
                                    "Name=anthy\n"
                                    "[GroupOrder]\n"
                                    "0=Default\n";

constexpr const char *fcitxBehaviour = "[Behavior]\n"
                                       "ActiveByDefault=True\n";

void write(const Desktop &desktop, const std::string &name, const char *content)
{
    QFile file(QString::fromStdString(desktop.file(name)));
    if (!QDir().mkpath(QFileInfo(file).path()) || !file.open(QIODevice::WriteOnly)
        || file.write(content) < 0)
        throw std::runtime_error("cannot write " + name);
}

} // namespace

InputMethod::InputMethod(Desktop &desktop, InputMethodKind kind)
    : m_kind(kind)
    , m_variables {
        "DBUS_SESSION_BUS_ADDRESS=" + desktop.sessionBus(),
        "GSETTINGS_BACKEND=keyfile",
        // The engine of ibus is run by the first python3 there is, and a developer's own has not
        // the desktop's modules.
        "PATH=/usr/bin:/bin",
    }
    , m_daemon(daemon(desktop))
{
    awaitIt(desktop);
}

ChildProcess::Command InputMethod::daemon(Desktop &desktop) const
{
    std::vector<std::string> command;
    if (m_kind == InputMethodKind::Ibus) {
        write(desktop, "home/.config/glib-2.0/settings/keyfile", ibusSettings);
        command = { "ibus-daemon", "--desktop=none", "--cache=none",
            "--panel=/usr/libexec/ibus-ui-gtk3", "--config=disable", "--emoji-extension=disable" };
    } else {
        write(desktop, "home/.config/fcitx5/profile", fcitxGroups);
        write(desktop, "home/.config/fcitx5/config", fcitxBehaviour);
        command = { "fcitx5" };
    }
    return { command, desktop.environment(m_variables), desktop.file("input-method.log") };
}

std::vector<std::string> InputMethod::environment() const
{
    return { m_variables.front(),
        m_kind == InputMethodKind::Ibus ? "QT_IM_MODULE=ibus" : "QT_IM_MODULE=fcitx" };
}

std::string InputMethod::askedOf(
    const Desktop &desktop, const std::vector<std::string> &command) const
{
    ChildProcess asked(
        { command, desktop.environment(m_variables), desktop.file("input-method.log") });
    require([&] { return asked.exitStatus().has_value(); }, command.front() + " to answer");
    return asked.takeLine().value_or("");
}

void InputMethod::awaitIt(const Desktop &desktop) const
{
    const bool isIbus = m_kind == InputMethodKind::Ibus;
    // The other one tells which group of engines it uses; it has one.
    const auto question = isIbus ? std::vector<std::string> { "ibus", "engine" }
                                 : std::vector<std::string> { "fcitx5-remote", "-q" };
    require([&] { return askedOf(desktop, question) == (isIbus ? "anthy" : "Default"); },
        question.front() + " to know its engine");
}

} // namespace penwick::desktop
