// SPDX-License-Identifier: MIT
// The figures of all scales, on their way from the measuring processes to one table.
#pragma once

#include "Figure.h"

#include <string>
#include <vector>

namespace penwick::bench {

/// A figure and the scale at which it was measured.
struct ScaledFigure
{
    int scale = 1; ///< pixels a point
    Figure figure;
};

/// One line of text without its end, for figureFrom() to read.
[[nodiscard]] std::string lineOf(const ScaledFigure &figure);
/// What lineOf() wrote; nothing for any other line.
[[nodiscard]] std::optional<ScaledFigure> figureFrom(const std::string &line);

/// Prints the table on standard output, as Markdown. Whether every target is met.
bool printTable(const std::vector<ScaledFigure> &figures);

} // namespace penwick::bench
