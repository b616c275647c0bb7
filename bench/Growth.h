// SPDX-License-Identifier: MIT
// How costs grow with the drawing.
#pragma once

namespace penwick::bench {

/// Prints, as CSV, what events cost on one board that grows from no stroke to 100,000: the number
/// of strokes and microseconds of processor time, each the median of many. Needs a QApplication.
void printGrowth();

} // namespace penwick::bench
