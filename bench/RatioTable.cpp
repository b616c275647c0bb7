// SPDX-License-Identifier: MIT
#include "RatioTable.h"

#include <cstdio>

namespace penwick::bench {

void RatioTable::ReportRuns(const std::vector<Run> &reports)
{
    ConsoleReporter::ReportRuns(reports);
    for (const Run &run : reports) {
        if (run.aggregate_name != "median")
            continue;
        const std::string &operation = run.run_name.function_name;
        const double perSecond = benchmark::GetTimeUnitMultiplier(run.time_unit);
        m_medians[operation][std::stoi(run.run_name.args)]
            = run.GetAdjustedRealTime() / perSecond * 1e6;
    }
}

void RatioTable::print() const
{
    std::printf("\nMedians in microseconds, and how many times the empty canvas\n");
    for (const auto &[operation, medians] : m_medians) {
        std::printf("%-18s", operation.c_str());
        for (const auto &[strokes, median] : medians)
            std::printf(
                "  %6d: %12.2f  x%-9.2f", strokes, median, median / medians.begin()->second);
        std::printf("\n");
    }
}

} // namespace penwick::bench
