// SPDX-License-Identifier: MIT
// The process stop and the line that it leaves.
#include "platform/foundation/FatalError.h"

#include <gtest/gtest.h>

#include <csignal>

namespace {

using penwick::platform::fatalError;
using penwick::platform::require;

TEST(FatalErrorDeathTest, writesOneLineAndAborts)
{
    EXPECT_EXIT(fatalError("the window is gone"), ::testing::KilledBySignal(SIGABRT),
        "^penwick: fatal error: the window is gone\n$");
}

TEST(FatalErrorDeathTest, requiringWhatIsNotThereStopsTheProcess)
{
    const int *const nothing = nullptr;

    EXPECT_DEATH(
        static_cast<void>(*require(nothing, "no number")), "^penwick: fatal error: no number\n$");
}

TEST(FatalError, requiringWhatIsThereYieldsItself)
{
    const int number = 7;

    EXPECT_EQ(require(&number, "no number"), &number);
}

} // namespace
