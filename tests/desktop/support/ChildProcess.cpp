// SPDX-License-Identifier: MIT
#include "desktop/support/ChildProcess.h"

#include "desktop/support/WaitUntil.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <stdexcept>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace penwick::desktop {

namespace {

struct Pipe
{
    int readEnd = -1;
    int writeEnd = -1;
};

Pipe makePipe()
{
    std::array<int, 2> ends {};
    if (pipe2(ends.data(), O_CLOEXEC) != 0)
        throw std::runtime_error(std::string("no pipe: ") + std::strerror(errno));
    return { ends[0], ends[1] };
}

std::vector<char *> pointersTo(std::vector<std::string> &strings)
{
    std::vector<char *> pointers;
    pointers.reserve(strings.size() + 1);
    for (std::string &string : strings)
        pointers.push_back(string.data());
    pointers.push_back(nullptr);
    return pointers;
}

// Between fork and exec: system calls only. Never returns.
[[noreturn]] void becomeProgram(char *const *arguments, char *const *environment,
    const char *errorFile, int input, int output, int failure, pid_t parent)
{
    // The parent may have died before the request took effect; then nobody would end us.
    prctl(PR_SET_PDEATHSIG, SIGTERM);
    if (getppid() != parent)
        _exit(1);
    setpgid(0, 0);
    dup2(input, STDIN_FILENO);
    dup2(output, STDOUT_FILENO);
    const int errors = open(errorFile, O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0600);
    if (errors >= 0)
        dup2(errors, STDERR_FILENO);
    execvpe(arguments[0], arguments, environment);

    const int reason = errno;
    [[maybe_unused]] const auto written = write(failure, &reason, sizeof reason);
    _exit(127);
}

} // namespace

ChildProcess::ChildProcess(const Command &command)
{
    std::vector<std::string> arguments = command.arguments;
    std::vector<std::string> environment = command.environment;
    const std::vector<char *> argumentPointers = pointersTo(arguments);
    const std::vector<char *> environmentPointers = pointersTo(environment);
    const Pipe input = makePipe();
    const Pipe output = makePipe();
    const Pipe failure = makePipe();
    // A program that ended must not end the test by a write to it.
    std::signal(SIGPIPE, SIG_IGN);

    const pid_t parent = getpid();
    m_id = fork();
    if (m_id == 0) {
        std::signal(SIGPIPE, SIG_DFL);
        becomeProgram(argumentPointers.data(), environmentPointers.data(),
            command.errorFile.c_str(), input.readEnd, output.writeEnd, failure.writeEnd, parent);
    }
    close(input.readEnd);
    close(output.writeEnd);
    close(failure.writeEnd);
    m_input = input.writeEnd;
    m_output = output.readEnd;
    fcntl(m_output, F_SETFL, O_NONBLOCK);

    int reason = m_id < 0 ? errno : 0;
    const bool failed = m_id < 0 || read(failure.readEnd, &reason, sizeof reason) > 0;
    close(failure.readEnd);
    if (!failed)
        return;
    if (m_id > 0)
        waitpid(m_id, nullptr, 0);
    close(m_input);
    close(m_output);
    throw std::runtime_error("cannot start " + arguments.front() + ": " + std::strerror(reason));
}

// NOLINTNEXTLINE(bugprone-exception-escape): a program that no kill ends is to end the test
ChildProcess::~ChildProcess()
{
    end();
    close(m_input);
    close(m_output);
}

std::optional<std::string> ChildProcess::takeLine()
{
    readOutput();
    const std::size_t lineFeed = m_unread.find('\n');
    if (lineFeed == std::string::npos)
        return std::nullopt;
    std::string line = m_unread.substr(0, lineFeed);
    m_unread.erase(0, lineFeed + 1);
    return line;
}

void ChildProcess::readOutput()
{
    std::array<char, 4096> buffer {};
    ssize_t count = 0;
    while ((count = read(m_output, buffer.data(), buffer.size())) > 0)
        m_unread.append(buffer.data(), static_cast<std::size_t>(count));
}

void ChildProcess::writeLine(const std::string &line)
{
    const std::string text = line + '\n';
    if (write(m_input, text.data(), text.size()) != static_cast<ssize_t>(text.size()))
        throw std::runtime_error("the started program does not read its input");
}

std::optional<int> ChildProcess::exitStatus()
{
    int status = 0;
    if (!m_status && waitpid(m_id, &status, WNOHANG) == m_id)
        m_status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
    return m_status;
}

void ChildProcess::end()
{
    constexpr std::chrono::milliseconds politeBound { 2000 };
    if (exitStatus())
        return;
    kill(m_id, SIGTERM);
    const bool wentPolitely = waitUntil([this] { return exitStatus().has_value(); }, politeBound);
    // Also what it started itself and left behind.
    kill(-m_id, SIGKILL);
    if (!wentPolitely)
        require([this] { return exitStatus().has_value(); }, "a killed program to end");
}

} // namespace penwick::desktop
