// SPDX-License-Identifier: MIT
// Random sessions on the assembled component, held against the second model step by step.
#include "soak/Run.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <iostream>

namespace penwick::test {

constexpr std::uint64_t sessionCount = 2000;
constexpr int mostSteps = 200;

TEST(RandomSessions, everySessionGoesAsTheSecondModelSays)
{
    const std::uint64_t first = freshSeed();
    std::cout << sessionCount << " sessions of up to " << mostSteps << " steps from seed " << first
              << " on; repeat them with penwick-soak --seed " << first << " --steps " << mostSteps
              << " --sessions " << sessionCount << std::endl;

    for (std::uint64_t seed = first; seed < first + sessionCount; ++seed) {
        const auto failure = runSession(seed, mostSteps);
        ASSERT_FALSE(failure) << *failure;
    }
}

} // namespace penwick::test
