// SPDX-License-Identifier: MIT
#include <penwick/platform/WindowResponder.h>

namespace penwick::platform {

WindowResponder::~WindowResponder() = default;

} // namespace penwick::platform
