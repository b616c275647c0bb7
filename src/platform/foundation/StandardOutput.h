// SPDX-License-Identifier: MIT
// The lines by which the component reports a recoverable oddity.
#pragma once

#include <string_view>

namespace penwick::platform {

/// Writes `line` and a line feed to standard output, byte for byte, and flushes it.
void printLine(std::string_view line);

} // namespace penwick::platform
