// SPDX-License-Identifier: MIT
// The whole program but its entry, so that a test may run it with something added.
#pragma once

#include <functional>

namespace penwick::host {

class Session;

/// Runs penwick-host with these arguments and returns its exit status. `onOpened` is called, if it
/// is set, between the opening of the window and the event loop.
[[nodiscard]] int runHost(
    int argumentCount, char **arguments, const std::function<void(Session &)> &onOpened = {});

} // namespace penwick::host
