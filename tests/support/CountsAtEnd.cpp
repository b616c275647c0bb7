// SPDX-License-Identifier: MIT
// Writes the counts of a coverage build when a signal ends the process.
// A process writes them only when it ends by itself; but the death tests end by abort(), and the
// desktop tests end a host that is no longer needed by SIGTERM.
#include <csignal>

// NOLINTNEXTLINE(bugprone-reserved-identifier): the compiler's own name
extern "C" void __gcov_dump(void);

namespace {

void writeCounts(int signal);

/// Steps in front of whatever was to happen on one signal: each library of a process has counts,
/// and so one of these, of its own.
class Interposer
{
public:
    explicit Interposer(int signal)
    {
        struct sigaction action = {};
        action.sa_handler = writeCounts;
        sigaction(signal, &action, &m_before);
    }

    /// What was to happen happens as soon as the handler returns.
    void goOn(int signal) const
    {
        sigaction(signal, &m_before, nullptr);
        std::raise(signal);
    }

private:
    struct sigaction m_before = {};
};

Interposer onAbort(SIGABRT);
Interposer onTermination(SIGTERM);

void writeCounts(int signal)
{
    __gcov_dump();
    (signal == SIGABRT ? onAbort : onTermination).goOn(signal);
}

} // namespace
