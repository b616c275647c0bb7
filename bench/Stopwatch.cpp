// SPDX-License-Identifier: MIT
#include "Stopwatch.h"

#include <algorithm>
#include <chrono>
#include <ctime>

namespace penwick::bench {

namespace {

double cpuNow()
{
#ifdef CLOCK_PROCESS_CPUTIME_ID
    timespec now {};
    ::clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) * 1e6 + static_cast<double>(now.tv_nsec) * 1e-3;
#else
    return static_cast<double>(std::clock()) * (1e6 / CLOCKS_PER_SEC);
#endif
}

double wallNow()
{
    const auto now = std::chrono::steady_clock::now().time_since_epoch();
    return std::chrono::duration<double, std::micro>(now).count();
}

} // namespace

Stopwatch::Stopwatch()
{
    m_start.wall = wallNow();
    m_start.cpu = cpuNow();
}

Time Stopwatch::elapsed() const
{
    const double cpu = cpuNow();
    return { cpu - m_start.cpu, wallNow() - m_start.wall };
}

void Samples::add(Time time, int events)
{
    m_cpu.push_back(time.cpu / events);
    m_wall.push_back(time.wall / events);
}

double Samples::cpu() const
{
    return median(m_cpu);
}

double Samples::wall() const
{
    return median(m_wall);
}

double median(std::span<const double> values)
{
    std::vector<double> ordered(values.begin(), values.end());
    const auto middle = ordered.begin() + static_cast<std::ptrdiff_t>(ordered.size() / 2);
    std::nth_element(ordered.begin(), middle, ordered.end());
    return *middle;
}

} // namespace penwick::bench
