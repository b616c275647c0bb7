// SPDX-License-Identifier: MIT
// A program that a test starts and that never outlives it.
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include <sys/types.h>

namespace penwick::desktop {

/// One started program with its output read line by line.
///
/// Ended by the destructor, and by the system when the test process dies in any way. It leads a
/// process group of its own, so that what it started itself is ended with it.
class ChildProcess final
{
public:
    struct Command
    {
        std::vector<std::string> arguments; ///< the program first, looked up in PATH
        std::vector<std::string> environment; ///< all of it, each "NAME=value"
        std::string errorFile; ///< standard error goes here
    };

    /// Throws a runtime_error with the reason when the program cannot be started.
    explicit ChildProcess(const Command &command);
    // NOLINTNEXTLINE(bugprone-exception-escape): a program that no kill ends is to end the test
    ~ChildProcess();
    ChildProcess(const ChildProcess &) = delete;
    ChildProcess &operator=(const ChildProcess &) = delete;

    [[nodiscard]] pid_t id() const { return m_id; }

    /// The next whole line of standard output without its line feed; nothing while there is none.
    [[nodiscard]] std::optional<std::string> takeLine();

    /// Writes `line` and a line feed to standard input.
    void writeLine(const std::string &line);

    /// Status it ended with, 128 + signal after a signal; nothing while it runs.
    [[nodiscard]] std::optional<int> exitStatus();

    /// Ends it: politely, then, after a bound, by force. Nothing happens when it has ended.
    void end();

private:
    void readOutput();

    pid_t m_id = -1;
    int m_input = -1; // write end
    int m_output = -1; // read end, never blocks
    std::string m_unread;
    std::optional<int> m_status;
};

} // namespace penwick::desktop
