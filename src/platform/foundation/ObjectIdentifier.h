// SPDX-License-Identifier: MIT
// Identifiers of objects: what "the same object" means in records that outlive pointers.
#pragma once

#include <cstdint>

namespace penwick::platform {

/// A number that no other object of this process was or will be given. Any thread.
/// Counted rather than taken from the address, so that an object that dies never hands its
/// identifier on to the next one at the same place.
[[nodiscard]] std::int64_t nextObjectIdentifier();

} // namespace penwick::platform
