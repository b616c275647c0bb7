// SPDX-License-Identifier: MIT
// What a run has measured, held against the empty canvas.
#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <string>
#include <vector>

namespace penwick::bench {

/// Prints Google Benchmark's own lines and keeps the medians for a table.
class RatioTable final : public benchmark::ConsoleReporter
{
public:
    void ReportRuns(const std::vector<Run> &reports) override;

    /// A line for each operation: its median on each canvas and how many times that of the empty
    /// one it is.
    void print() const;

private:
    std::map<std::string, std::map<int, double>> m_medians; // microseconds, by number of strokes
};

} // namespace penwick::bench
