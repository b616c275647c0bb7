// SPDX-License-Identifier: MIT
// For platforms whose protocol we do not speak.
#include "platform/native/NativeDesktop.h"

namespace penwick::platform {

std::unique_ptr<NativeDesktop> makeNativeDesktop()
{
    return nullptr;
}

} // namespace penwick::platform
