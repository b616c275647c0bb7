// SPDX-License-Identifier: MIT
#include "appearance/PenwickBundle.h"

namespace penwick {

namespace {

std::shared_ptr<platform::Bundle> &bundleReference()
{
    // Never destroyed: it may still be asked for while the process ends.
    static auto *const reference = new std::shared_ptr<platform::Bundle>;
    return *reference;
}

} // namespace

const std::shared_ptr<platform::Bundle> &penwickBundle()
{
    return bundleReference();
}

void setPenwickBundle(std::shared_ptr<platform::Bundle> bundle)
{
    bundleReference() = std::move(bundle);
}

} // namespace penwick
