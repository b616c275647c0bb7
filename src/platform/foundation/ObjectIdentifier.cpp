// SPDX-License-Identifier: MIT
#include "platform/foundation/ObjectIdentifier.h"

#include <atomic>

namespace penwick::platform {

std::int64_t nextObjectIdentifier()
{
    static std::atomic<std::int64_t> last { 0 };
    return ++last;
}

} // namespace penwick::platform
