// SPDX-License-Identifier: MIT
// A reference that its target may leave.
#include "platform/WeakReference.h"

#include <gtest/gtest.h>

#include <memory>

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
    auto target = std::make_unique<Target>();
    const WeakReference<Contract> reference(target.get());
    EXPECT_EQ(reference.get(), static_cast<Contract *>(target.get()));

    target.reset();

    EXPECT_EQ(reference.get(), nullptr);
}

} // namespace penwick::platform
