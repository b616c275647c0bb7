// SPDX-License-Identifier: MIT
// The program under test, run on a private desktop and watched through its log.
#pragma once

#include "desktop/support/ChildProcess.h"
#include "desktop/support/WaitUntil.h"

#include <QJsonObject>
#include <QJsonValue>
#include <QMap>
#include <QPoint>
#include <QRect>
#include <QString>

#include <string>
#include <vector>

namespace penwick::desktop {

class Desktop;

/// Where a window of the component is, in screen pixels from the top left.
struct WindowState
{
    bool isVisible = false;
    QRect frame; ///< title bar included
    QMap<QString, QPoint> buttons; ///< centres of the visible identified buttons
};

struct PostedNotification
{
    QString name; ///< in full
    QJsonValue object;
};

/// What stands in the text box that has the keyboard.
struct Writing
{
    QString text;
    QString composed; ///< by an input method, and not part of the text yet
    QRect caret; ///< as the input method is told it; screen pixels from the top left
};

enum class HostProgram
{
    AsShipped, ///< penwick-host itself
    Steered, ///< the same program, which also takes orders while it runs
};

/// One run of penwick-host with --log. Lines that it printed are taken in whenever something is
/// asked, in their order. Ended by the destructor if it has not ended itself.
class HostProcess final
{
public:
    /// `arguments` beside --log, `variables` ("NAME=value") beside the desktop's own, or
    /// instead of them.
    explicit HostProcess(const Desktop &desktop, const std::vector<std::string> &arguments = {},
        HostProgram program = HostProgram::AsShipped,
        const std::vector<std::string> &variables = {});

    /// Waits until the window called `name` is shown and at rest, and returns where it is. Throws
    /// a runtime_error with all that the program wrote when it does not come.
    WindowState waitForWindow(const QString &name);

    /// Waits until a notification whose name ends in `suffix` has been posted and returns the
    /// object of the first one. Throws like waitForWindow().
    QJsonValue waitForNotification(const QString &suffix);

    /// Waits until it has ended and returns the status, 128 + signal after a signal.
    int waitForExit(std::chrono::milliseconds bound = generousBound);

    /// Gives the running program an order, as steered/main.cpp lists them, and returns once it has
    /// been carried out. Needs the steered program.
    void steer(const QString &order);
    /// Chooses a tool or an option in it, as its tool bar would.
    void selectTool(const QString &name) { steer(QStringLiteral("tool ") + name); }
    void selectToolOption(const QString &option) { steer(QStringLiteral("option ") + option); }

    /// What the component says of its window's frame: points, y up from the primary screen's
    /// bottom left corner. Needs the steered program.
    [[nodiscard]] QRect frame();

    /// Empty if no text box has the keyboard. Needs the steered program.
    [[nodiscard]] Writing writing();

    [[nodiscard]] const std::vector<PostedNotification> &notifications();
    /// The state of the window called `name` that was written last; an invisible one before that.
    [[nodiscard]] WindowState window(const QString &name);
    /// Lines of standard output that are not the log's.
    [[nodiscard]] const QStringList &printedLines();
    [[nodiscard]] QString errorOutput() const;
    [[nodiscard]] int processId() const { return static_cast<int>(m_process.id()); }

private:
    void takeLines();
    void takeEvent(const QJsonObject &event);
    template <class Condition>
    void requireWhileRunning(Condition &&condition, const QString &what);

    const std::string m_errorFile;
    ChildProcess m_process;
    std::vector<PostedNotification> m_notifications;
    QMap<QString, WindowState> m_windows;
    QStringList m_printedLines;
    int m_callsDone = 0;
    QRect m_frame;
    Writing m_writing;
};

} // namespace penwick::desktop
