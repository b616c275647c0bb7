// SPDX-License-Identifier: MIT
// Runs of random sessions, each of which can be repeated by its seed.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace penwick::test {

/// A seed that no other run has.
[[nodiscard]] std::uint64_t freshSeed();

/// Goes through the session of `seed`, of up to `steps` steps. Answers what differed from the
/// second model in the shortest such session that was found, and how to repeat it; nothing if
/// nothing did. A session that ends the process prints its seed before.
[[nodiscard]] std::optional<std::string> runSession(std::uint64_t seed, int steps);

/// What the session of `seed` says of itself, which Session::play() takes.
[[nodiscard]] std::vector<std::string> linesOf(std::uint64_t seed, int steps);

} // namespace penwick::test
