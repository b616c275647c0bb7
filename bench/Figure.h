// SPDX-License-Identifier: MIT
// One line of what the program prints, and everything that yields such lines.
#pragma once

#include "Stopwatch.h"

#include <optional>
#include <string>
#include <vector>

namespace penwick::bench {

/// The most that a figure may be. If both limits are there, to keep one of them is enough; without
/// either there is no target.
struct Target
{
    std::optional<double> most; ///< in the figure's own unit
    std::optional<double> mostTimes; ///< what it is held against
};

/// Something measured, what it is held against and what it is to reach.
struct Figure
{
    std::string name; ///< beginning with the target's number; no tabs
    std::string unit; ///< "us" is microseconds of processor time
    double measured = 0.0;
    std::optional<double> against; ///< the other thing, measured beside it
    Target target;
    std::optional<double> wall {}; ///< the measured, in microseconds of the wall's clock
};

/// A figure of times alone, and of times held against others.
[[nodiscard]] Figure timeOf(const std::string &name, const Samples &measured, Target target);
[[nodiscard]] Figure timeOf(
    const std::string &name, const Samples &measured, const Samples &against, Target target);

/// How many times the other thing it is; nothing where there is none.
[[nodiscard]] std::optional<double> ratioOf(const Figure &figure);
/// Whether the target is met; nothing where there is none.
[[nodiscard]] std::optional<bool> isMet(const Figure &figure);

using Figures = std::vector<Figure>;

/// What is measured, in the order of the numbers. Each needs a QApplication and no other board.
[[nodiscard]] Figures dragFigures();
[[nodiscard]] Figures longStrokeFigures();
[[nodiscard]] Figures eraserFigures();
[[nodiscard]] Figures historyFigures();
[[nodiscard]] Figures windowFigures();
[[nodiscard]] Figures memoryFigures();
[[nodiscard]] Figures idleFigures();
[[nodiscard]] Figures openingFigures();
[[nodiscard]] Figures textFigures();

} // namespace penwick::bench
