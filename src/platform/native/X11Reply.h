// SPDX-License-Identifier: MIT
// Replies of the X server, freed when they go out of scope.
#pragma once

#include <cstdlib>
#include <memory>

namespace penwick::platform {

/// Takes `reply`, which may be null.
template <class Reply>
std::unique_ptr<Reply, decltype(&std::free)> owned(Reply *reply)
{
    return { reply, &std::free };
}

} // namespace penwick::platform
