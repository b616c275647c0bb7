// SPDX-License-Identifier: MIT
// The one way in which a broken invariant ends the process.
#pragma once

namespace penwick::platform {

/// Writes "penwick: fatal error: " and `what` as one line to standard error, then aborts.
/// `what` names the invariant, not the function: "the drawing window is gone".
[[noreturn]] void fatalError(const char *what);

/// `pointer` itself; a fatal error that says `what` where it is null.
template <class Pointer>
Pointer &&require(Pointer &&pointer, const char *what)
{
    if (!pointer)
        fatalError(what);
    return static_cast<Pointer &&>(pointer);
}

} // namespace penwick::platform
