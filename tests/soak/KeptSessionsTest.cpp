// SPDX-License-Identifier: MIT
// Sessions that once differed from the second model, by what was special in them.
#include "soak/Run.h"

#include <gtest/gtest.h>

#include <cstdint>

namespace penwick::test {
namespace {

struct Kept
{
    const char *name;
    std::uint64_t seed;
    int steps;
};

class KeptSession : public testing::TestWithParam<Kept>
{ };

} // namespace

TEST_P(KeptSession, goesAsTheSecondModelSays)
{
    const auto failure = runSession(GetParam().seed, GetParam().steps, Kinds::Former);

    EXPECT_FALSE(failure) << *failure;
}

INSTANTIATE_TEST_SUITE_P(All, KeptSession,
    testing::Values(Kept { "popoverOpenedWhileTheBoardIsHidden", 8, 200 },
        Kept { "boardMinimisedWhileAToolWaits", 31, 200 },
        Kept { "placedBoxDeletedByAKey", 122, 200 },
        Kept { "boxMadeUndoneAndClearedByOneRelease", 164, 200 },
        Kept { "clearWaitingWhileTheDeleteButtonIsPressed", 402, 200 },
        Kept { "endWaitingWhileTheBoardIsMinimised", 465, 200 },
        Kept { "deleteButtonPressedWhileABoxComesBack", 500078, 2000 }),
    [](const auto &kept) { return std::string(kept.param.name); });

} // namespace penwick::test
