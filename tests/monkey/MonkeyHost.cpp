// SPDX-License-Identifier: MIT
#include "monkey/MonkeyHost.h"

#include "desktop/support/WaitUntil.h"

#include <QFile>
#include <QImage>

#include <stdexcept>

namespace penwick::desktop {

namespace {

// A sanitized program is slow, and slower still while it looks for leaks at its end.
constexpr std::chrono::seconds bound { 60 };

} // namespace

MonkeyHost::MonkeyHost(Desktop &desktop, std::string program, std::string kind)
    : m_desktop(desktop)
    , m_program(std::move(program))
    , m_kind(std::move(kind))
    , m_errorFile(desktop.file("monkey-host.log"))
{
    QImage picture(640, 400, QImage::Format_RGB32);
    picture.fill(Qt::lightGray);
    picture.save(QString::fromStdString(desktop.file("picture.png")));
    open();
}

void MonkeyHost::open()
{
    ChildProcess::Command command { { m_program, "--window", m_kind, "--announce" },
        m_desktop.environment(), m_errorFile };
    if (m_kind == "imageAnnotation") {
        command.arguments.emplace_back("--image");
        command.arguments.push_back(m_desktop.file("picture.png"));
    }
    for (const char *const variable : { "QT_QPA_PLATFORM=xcb", "QT_FATAL_WARNINGS=1",
             "UBSAN_OPTIONS=print_stacktrace=1", "ASAN_OPTIONS=detect_leaks=1" })
        command.environment.emplace_back(variable);
    command.environment.emplace_back(
        "LSAN_OPTIONS=suppressions=" PENWICK_LEAKS_OF_OTHERS ":print_suppressions=0");
    m_process.reset();
    m_process = std::make_unique<ChildProcess>(command);
    ++m_sessions;
    awaitAnswer();
}

void MonkeyHost::awaitAnswer()
{
    try {
        m_process->writeLine("answer");
    } catch (const std::runtime_error &) {
        // The host has just ended, which keepOpen() deals with below.
    }
    bool hasAnswered = false;
    const bool isDone = waitUntil(
        [&] {
            while (const auto line = m_process->takeLine())
                hasAnswered = hasAnswered || line->find("called") != std::string::npos;
            return hasAnswered || m_process->exitStatus();
        },
        bound);
    if (!isDone)
        throw std::runtime_error("the host does not answer");
    if (!hasAnswered)
        keepOpen();
}

void MonkeyHost::keepOpen()
{
    while (m_process->takeLine()) { }
    if (!m_process->exitStatus())
        return;
    requireGoodEnd();
    open();
}

void MonkeyHost::end()
{
    m_process->writeLine("tool state");
    require([this] { return m_process->exitStatus().has_value(); }, "the session to end", bound);
    requireGoodEnd();
}

void MonkeyHost::requireGoodEnd()
{
    const std::string errors = errorOutput();
    if (*m_process->exitStatus() != 0 || errors.find("Sanitizer") != std::string::npos
        || errors.find("runtime error") != std::string::npos)
        throw std::runtime_error(
            "the host ended with status " + std::to_string(*m_process->exitStatus()));
}

std::string MonkeyHost::errorOutput() const
{
    QFile file(QString::fromStdString(m_errorFile));
    return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : std::string();
}

} // namespace penwick::desktop
