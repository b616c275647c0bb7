// SPDX-License-Identifier: MIT
#include "platform/view/ViewInput.h"

namespace penwick::platform {

ViewInput &ViewInput::shared()
{
    static auto *const input = new ViewInput; // views may go while the process ends
    return *input;
}

} // namespace penwick::platform
