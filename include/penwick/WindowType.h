// SPDX-License-Identifier: MIT
// The kinds of drawing window.
#pragma once

#include <penwick/Export.h>

#include <cstdint>
#include <optional>

namespace penwick {

/// What a drawing window lies on. Compared and hashed by its raw value.
enum class WindowType : std::uintptr_t
{
    whiteboard = 0, ///< a white board in an ordinary titled window
    annotation = 1, ///< a transparent layer over a whole screen
    imageAnnotation = 2, ///< a layer over a still image
};

/// The kind whose raw value is `rawValue`; nothing where there is none. Any thread.
[[nodiscard]] PENWICK_EXPORT std::optional<WindowType> windowTypeFromRawValue(
    std::uintptr_t rawValue);

} // namespace penwick
