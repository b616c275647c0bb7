// SPDX-License-Identifier: MIT
#include "soak/Run.h"

#include "soak/Session.h"
#include "soak/Step.h"

#include <csignal>
#include <cstdio>
#include <random>
#include <sstream>
#include <unistd.h>

namespace penwick::test {

namespace {

constexpr int mostTries = 3000; // at a shorter session that shows the same

std::string present; // how to repeat the session under way

std::string howToRepeat(std::uint64_t seed, int steps)
{
    return "penwick-soak --seed " + std::to_string(seed) + " --steps " + std::to_string(steps)
        + " --sessions 1";
}

void tellSeedAndEnd(int signal)
{
    // Nothing but what a signal handler may do.
    static_cast<void>(!write(STDERR_FILENO, present.data(), present.size()));
    std::signal(signal, SIG_DFL);
    std::raise(signal);
}

void tellSeedWhenStopped()
{
    static const bool isSet = [] {
        for (const int signal : { SIGABRT, SIGSEGV, SIGALRM, SIGTERM })
            std::signal(signal, tellSeedAndEnd);
        return true;
    }();
    static_cast<void>(isSet);
}

} // namespace

std::uint64_t freshSeed()
{
    std::random_device device;
    return device() & 0x7fffffffU; // short enough to be copied by hand
}

std::optional<std::string> runSession(std::uint64_t seed, int steps)
{
    tellSeedWhenStopped();
    present = "\nstopped in this session: " + howToRepeat(seed, steps) + "\n";
    Session session;
    auto shortest = stepsOf(seed, steps);
    auto found = session.run(shortest.value());
    if (!found)
        return std::nullopt;
    auto shrinks = shortest.shrinks();
    for (int tries = 0; tries < mostTries; ++tries) {
        const auto next = shrinks.next();
        if (!next)
            break;
        auto failure = session.run(next->value());
        if (!failure)
            continue;
        found = failure;
        shrinks = next->shrinks();
    }
    return "repeat it with " + howToRepeat(seed, steps) + "\n" + *found;
}

std::vector<std::string> linesOf(std::uint64_t seed, int steps)
{
    Session session;
    static_cast<void>(session.run(stepsOf(seed, steps).value()));
    return session.said();
}

} // namespace penwick::test
