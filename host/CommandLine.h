// SPDX-License-Identifier: MIT
// What penwick-host was asked to do.
// Parsed before there is a QApplication, so that a mistake is told on a machine without a display.
#pragma once

#include <penwick/WindowType.h>

#include <QString>
#include <QStringList>

#include <optional>
#include <variant>
#include <vector>

namespace penwick::host {

/// One call on the draw view controller right after the window was shown.
struct StartCall
{
    enum class Operation
    {
        ToolSelection,
        ToolOptionSelection
    };

    Operation operation = Operation::ToolSelection;
    QString argument;

    friend bool operator==(const StartCall &, const StartCall &) = default;
};

/// A command line that makes sense in itself; whether the image and the screen are there is not
/// known yet. Where an option was given several times the last one counts.
struct Options
{
    enum class Action
    {
        OpenWindow,
        ShowHelp,
        ShowVersion
    };

    Action action = Action::OpenWindow;
    WindowType windowType = WindowType::whiteboard;
    std::optional<QString> imageFile;
    std::optional<QString> title;
    int screen = 0; ///< 0 or more; 0 is the primary screen
    bool announcesSharing = false;
    bool logsEvents = false;
    std::vector<StartCall> startCalls; ///< in the order given
    std::optional<QString> pictureFile; ///< where what was drawn is written at the end
};

/// Why a command line makes no sense: one line without the program's name.
struct UsageError
{
    QString message;
};

/// Reads `arguments`, the program's name left out. Stops at "--help" and "--version".
[[nodiscard]] std::variant<Options, UsageError> parseCommandLine(const QStringList &arguments);

/// The text of "--help", with its last line feed.
[[nodiscard]] QString helpText();

} // namespace penwick::host
