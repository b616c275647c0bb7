// SPDX-License-Identifier: MIT
// How long something takes, by the processor's clock and by the wall's.
#pragma once

#include <span>
#include <vector>

namespace penwick::bench {

/// In microseconds.
struct Time
{
    double cpu = 0.0; ///< of all threads of this process; other processes do not count
    double wall = 0.0;
};

/// Runs from its construction on.
class Stopwatch
{
public:
    Stopwatch();
    [[nodiscard]] Time elapsed() const;

private:
    Time m_start;
};

/// The times of many single events.
class Samples
{
public:
    /// Adds the time of `events` events, each of which counts as one that took its even share.
    void add(Time time, int events = 1);

    /// The medians, in microseconds; there must be a sample.
    [[nodiscard]] double cpu() const;
    [[nodiscard]] double wall() const;

private:
    std::vector<double> m_cpu;
    std::vector<double> m_wall;
};

/// The middle of `values`, which may not be empty.
[[nodiscard]] double median(std::span<const double> values);

} // namespace penwick::bench
