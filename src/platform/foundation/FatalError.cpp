// SPDX-License-Identifier: MIT
#include "platform/foundation/FatalError.h"

#include <cstdio>
#include <cstdlib>

namespace penwick::platform {

void fatalError(const char *what)
{
    std::fprintf(stderr, "penwick: fatal error: %s\n", what);
    std::fflush(stderr);
    std::abort();
}

} // namespace penwick::platform
