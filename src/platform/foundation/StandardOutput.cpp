// SPDX-License-Identifier: MIT
#include "platform/foundation/StandardOutput.h"

#include <cstdio>

namespace penwick::platform {

void printLine(std::string_view line)
{
    std::fwrite(line.data(), 1, line.size(), stdout);
    std::fputc('\n', stdout);
    std::fflush(stdout);
}

} // namespace penwick::platform
