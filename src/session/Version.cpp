// SPDX-License-Identifier: MIT
#include <penwick/Version.h>

// The build passes the project's version. There is only one division, so that the number is exactly
// the double nearest to its decimal spelling.
constinit const double PenwickVersionNumber
    = (PENWICK_VERSION_MAJOR * 10000 + PENWICK_VERSION_MINOR * 100 + PENWICK_VERSION_PATCH)
    / 10000.0;

constinit const char *const PenwickVersionString = PENWICK_VERSION;
