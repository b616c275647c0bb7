// SPDX-License-Identifier: MIT
#include <penwick/Version.h>

// The build passes the project's one version. One division, so that the number is the very double
// that its decimal spelling means.
constinit const double PenwickVersionNumber
    = (PENWICK_VERSION_MAJOR * 10000 + PENWICK_VERSION_MINOR * 100 + PENWICK_VERSION_PATCH)
    / 10000.0;

constinit const char *const PenwickVersionString = PENWICK_VERSION;
