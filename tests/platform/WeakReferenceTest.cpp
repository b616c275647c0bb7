// SPDX-License-Identifier: MIT
// A reference that its target may leave.
#include "platform/foundation/WeakReference.h"

#include <gtest/gtest.h>

#include <optional>
#include <utility>

namespace penwick::platform {

namespace {

/// A contract without QObject in it.
class Contract
{
public:
    virtual ~Contract() = default;
};

/// Somebody who fulfils it.
class Target final : public QObject, public Contract
{ };

} // namespace

TEST(WeakReference, newOneIsEmpty)
{
    EXPECT_EQ(WeakReference<Contract>().get(), nullptr);
    EXPECT_EQ(WeakReference<Contract>(nullptr).get(), nullptr);
}

TEST(WeakReference, targetIsFoundAsItsContractUntilItIsGone)
{
    std::optional<Target> target(std::in_place);
    const WeakReference<Contract> reference(&*target);
    EXPECT_EQ(reference.get(), static_cast<Contract *>(&*target));

    target.reset();

    EXPECT_EQ(reference.get(), nullptr);
}

} // namespace penwick::platform
