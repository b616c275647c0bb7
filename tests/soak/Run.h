// SPDX-License-Identifier: MIT
// Runs of random sessions, each of which can be repeated by its seed.
#pragma once

#include "soak/Step.h"

#include <cstdint>
#include <optional>
#include <string>

namespace penwick::test {

/// A seed that no other run has.
[[nodiscard]] std::uint64_t freshSeed();

/// Goes through the session of `seed`, of up to `steps` steps. Answers what differed from the
/// second model in the shortest such session that was found, and how to repeat it; nothing if
/// nothing did. A session that ends the process prints its seed before.
[[nodiscard]] std::optional<std::string> runSession(
    std::uint64_t seed, int steps, Kinds kinds = Kinds::All);

} // namespace penwick::test
