// SPDX-License-Identifier: MIT
// Things that are compared, measured in alternation.
#pragma once

#include "Stopwatch.h"

#include <functional>
#include <vector>

namespace penwick::bench {

/// Measures several things event by event, each in its turn, so that whatever slows the machine
/// down slows all of them. Everything that an event leaves to the event loop is done after it,
/// outside of what is measured.
class Turns
{
public:
    /// Does one event; it is told which one.
    using Event = std::function<void(int number)>;

    /// Adds something to be measured, and gives its place. `prepare` comes before each event and
    /// is not measured. `events` is how many events one call does; many where a single one is too
    /// short for the clock.
    std::size_t add(Event event, std::function<void()> prepare = {}, int events = 1);

    /// Lets each do an event, `rounds` times; a different one begins every round.
    void take(int rounds);

    /// What the one at `place` took.
    [[nodiscard]] const Samples &of(std::size_t place) const { return m_measured[place].samples; }

private:
    struct Measured
    {
        Event event;
        std::function<void()> prepare;
        int events = 1;
        Samples samples;
    };

    std::vector<Measured> m_measured;
    int m_next = 0; // event
};

} // namespace penwick::bench
