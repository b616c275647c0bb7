// SPDX-License-Identifier: MIT
// For platforms whose setting we do not ask for.
#include "platform/native/ContrastSource.h"

namespace penwick::platform {

std::unique_ptr<ContrastSource> makeContrastSource()
{
    return nullptr;
}

} // namespace penwick::platform
