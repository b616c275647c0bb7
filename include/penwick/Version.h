// SPDX-License-Identifier: MIT
// Which Penwick a process has loaded.
// Told by the library, not by this header: a host may run with another one than it was built with.
#pragma once

#include <penwick/Export.h>

// C names, so that a host that loads the library by hand finds them as they are spelt here.
extern "C" {

// NOLINTBEGIN(readability-identifier-naming): fixed names

/// Grows with every release: major + minor / 100 + patch / 10000, so that 1.2.3 is 1.0203. Any
/// thread.
extern PENWICK_EXPORT const double PenwickVersionNumber;

/// The same as text, "1.2.3". Never null. Any thread.
extern PENWICK_EXPORT const char *const PenwickVersionString;

// NOLINTEND(readability-identifier-naming)

} // extern "C"
