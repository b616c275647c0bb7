// SPDX-License-Identifier: MIT
#include "desktop/support/HostProcess.h"

#include "desktop/support/Desktop.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>
#include <stdexcept>

namespace penwick::desktop {

namespace {

ChildProcess::Command hostCommand(const Desktop &desktop, const std::string &errorFile,
    const std::vector<std::string> &arguments, HostProgram program,
    const std::vector<std::string> &variables)
{
    const char *const path
        = program == HostProgram::AsShipped ? PENWICK_HOST_PROGRAM : PENWICK_STEERED_HOST_PROGRAM;
    std::vector<std::string> beside { "QT_QPA_PLATFORM=xcb" };
    beside.insert(beside.end(), variables.begin(), variables.end());
    ChildProcess::Command command { { path, "--log" }, desktop.environment(beside), errorFile };
    command.arguments.insert(command.arguments.end(), arguments.begin(), arguments.end());
    return command;
}

QPoint pointFrom(const QJsonValue &value)
{
    return { value.toArray().at(0).toInt(), value.toArray().at(1).toInt() };
}

QRect rectangleFrom(const QJsonValue &value)
{
    const QJsonArray numbers = value.toArray();
    return { numbers.at(0).toInt(), numbers.at(1).toInt(), numbers.at(2).toInt(),
        numbers.at(3).toInt() };
}

} // namespace

HostProcess::HostProcess(const Desktop &desktop, const std::vector<std::string> &arguments,
    HostProgram program, const std::vector<std::string> &variables)
    : m_errorFile(desktop.file("host.log"))
    , m_process(hostCommand(desktop, m_errorFile, arguments, program, variables))
{ }

WindowState HostProcess::waitForWindow(const QString &name)
{
    requireWhileRunning([&] { return window(name).isVisible; },
        QStringLiteral("the window '%1' to be shown").arg(name));
    return m_windows.value(name);
}

QJsonValue HostProcess::waitForNotification(const QString &suffix)
{
    const auto find = [&] {
        return std::find_if(notifications().begin(), notifications().end(),
            [&](const PostedNotification &posted) { return posted.name.endsWith(suffix); });
    };
    // It may have been the last thing that the program did.
    requireWhileRunning([&] { return find() != m_notifications.end(); },
        QStringLiteral("the notification '%1'").arg(suffix));
    return find()->object;
}

int HostProcess::waitForExit(std::chrono::milliseconds bound)
{
    require([this] { return m_process.exitStatus().has_value(); }, "the program to end", bound);
    takeLines();
    return *m_process.exitStatus();
}

const std::vector<PostedNotification> &HostProcess::notifications()
{
    takeLines();
    return m_notifications;
}

WindowState HostProcess::window(const QString &name)
{
    takeLines();
    return m_windows.value(name);
}

const QStringList &HostProcess::printedLines()
{
    takeLines();
    return m_printedLines;
}

QString HostProcess::errorOutput() const
{
    QFile file(QString::fromStdString(m_errorFile));
    return file.open(QIODevice::ReadOnly) ? QString::fromLocal8Bit(file.readAll()) : QString();
}

void HostProcess::takeLines()
{
    while (const std::optional<std::string> line = m_process.takeLine()) {
        const QJsonDocument document = QJsonDocument::fromJson(QByteArray::fromStdString(*line));
        if (document.isObject())
            takeEvent(document.object());
        else
            m_printedLines.append(QString::fromStdString(*line));
    }
}

void HostProcess::takeEvent(const QJsonObject &event)
{
    const QString kind = event.value(QLatin1String("event")).toString();
    const QString name = event.value(QLatin1String("name")).toString();
    if (kind == QLatin1String("notification")) {
        m_notifications.push_back({ name, event.value(QLatin1String("object")) });
    } else if (kind == QLatin1String("called")) {
        ++m_callsDone;
    } else if (kind == QLatin1String("frame")) {
        m_frame = rectangleFrom(event.value(QLatin1String("rect")));
    } else if (kind == QLatin1String("writing")) {
        m_writing = { event.value(QLatin1String("text")).toString(),
            event.value(QLatin1String("composed")).toString(),
            rectangleFrom(event.value(QLatin1String("rect"))) };
    } else if (kind == QLatin1String("window")) {
        WindowState state { event.value(QLatin1String("visible")).toBool(),
            rectangleFrom(event.value(QLatin1String("rect"))), {} };
        const QJsonObject buttons = event.value(QLatin1String("buttons")).toObject();
        for (auto button = buttons.begin(); button != buttons.end(); ++button)
            state.buttons.insert(button.key(), pointFrom(button.value()));
        m_windows.insert(name, state);
    }
}

void HostProcess::steer(const QString &order)
{
    const int before = m_callsDone;
    m_process.writeLine(order.toStdString());
    requireWhileRunning(
        [&] {
            takeLines();
            return m_callsDone > before;
        },
        order);
}

QRect HostProcess::frame()
{
    steer(QStringLiteral("frame"));
    return m_frame;
}

Writing HostProcess::writing()
{
    steer(QStringLiteral("writing"));
    return m_writing;
}

template <class Condition>
void HostProcess::requireWhileRunning(Condition &&condition, const QString &what)
{
    bool hasEnded = false;
    const bool happened = waitUntil([&] {
        hasEnded = m_process.exitStatus().has_value();
        return condition() || hasEnded;
    }) && condition();
    if (happened)
        return;
    const QString reason = hasEnded
        ? QStringLiteral("the program ended with status %1").arg(*m_process.exitStatus())
        : QStringLiteral("time ran out");
    throw std::runtime_error(
        QStringLiteral("no sign of %1: %2\nit printed:\n%3\nits errors:\n%4")
            .arg(what, reason, m_printedLines.join(QLatin1Char('\n')), errorOutput())
            .toStdString());
}

} // namespace penwick::desktop
