// SPDX-License-Identifier: MIT
// The one reference to the component's resources.
#include "appearance/PenwickBundle.h"

#include <gtest/gtest.h>

namespace penwick::test {

TEST(PenwickBundle, isEmptyUntilItIsSet)
{
    EXPECT_EQ(penwickBundle(), nullptr);
}

TEST(PenwickBundle, newOneReplacesAndReleasesTheFormer)
{
    auto first = std::make_shared<platform::Bundle>(QString());
    const auto second = std::make_shared<platform::Bundle>(QString());
    const std::weak_ptr<platform::Bundle> watched = first;
    setPenwickBundle(std::move(first));
    EXPECT_FALSE(watched.expired());

    setPenwickBundle(second);

    EXPECT_EQ(penwickBundle(), second);
    EXPECT_TRUE(watched.expired());
    setPenwickBundle(nullptr);
}

} // namespace penwick::test
