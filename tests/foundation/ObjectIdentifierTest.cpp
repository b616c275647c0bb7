// SPDX-License-Identifier: MIT
// Identifiers are never handed out twice.
#include "platform/foundation/ObjectIdentifier.h"

#include <gtest/gtest.h>

#include <set>

namespace {

using penwick::platform::nextObjectIdentifier;

TEST(ObjectIdentifier, noIdentifierIsGivenTwice)
{
    std::set<std::int64_t> identifiers;

    for (int count = 0; count < 1000; ++count)
        identifiers.insert(nextObjectIdentifier());

    EXPECT_EQ(identifiers.size(), 1000U);
}

} // namespace
