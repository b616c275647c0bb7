// SPDX-License-Identifier: MIT
#include <penwick/WindowType.h>

namespace penwick {

std::optional<WindowType> windowTypeFromRawValue(std::uintptr_t rawValue)
{
    if (rawValue > static_cast<std::uintptr_t>(WindowType::imageAnnotation))
        return std::nullopt;
    return static_cast<WindowType>(rawValue);
}

} // namespace penwick
