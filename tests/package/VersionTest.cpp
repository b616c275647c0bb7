// SPDX-License-Identifier: MIT
#include <penwick/Version.h>

#include <gtest/gtest.h>

TEST(Version, stringIsTheProjectsVersion)
{
    EXPECT_STREQ(PenwickVersionString, PENWICK_VERSION);
}

TEST(Version, numberHasTwoDecimalPlacesForMinorAndTwoForPatch)
{
    EXPECT_DOUBLE_EQ(PenwickVersionNumber,
        PENWICK_VERSION_MAJOR + 0.01 * PENWICK_VERSION_MINOR + 0.0001 * PENWICK_VERSION_PATCH);
}
