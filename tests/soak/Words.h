// SPDX-License-Identifier: MIT
// How a session writes places and texts down, so that they can be read again.
#pragma once

#include "soak/PlainDrawing.h"

#include <string>

namespace penwick::test {

/// " 200,100"
[[nodiscard]] std::string inWords(Spot spot);
/// In single quotes, on one line.
[[nodiscard]] std::string quoted(const std::string &text);

/// The place at the end of `words`; (0, 0) where there is none.
[[nodiscard]] Spot spotIn(const std::string &words);
/// What stands in quotes in `words`.
[[nodiscard]] std::string textIn(const std::string &words);

} // namespace penwick::test
