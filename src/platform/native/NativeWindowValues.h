// SPDX-License-Identifier: MIT
// What a native window is to be sent, computed where every platform can test it.
#pragma once

#include <penwick/platform/WindowAttributes.h>

namespace penwick::platform {

/// The raw values that a window of AppKit's takes, and what follows from them on other desktops.
struct NativeWindowValues
{
    unsigned long styleMask = 0;
    unsigned long collectionBehavior = 0;
    long level = 0;
    unsigned long sharingType = 0;
    long titleVisibility = 0;
    long animationBehavior = 0;
    bool titlebarAppearsTransparent = false;
    bool hasShadow = true;
    bool isOnAllDesktops = false; ///< follows from the collection behaviour
    bool isLeftOutOfCaptures = false; ///< follows from the sharing type

    friend bool operator==(const NativeWindowValues &, const NativeWindowValues &) = default;
};

[[nodiscard]] NativeWindowValues nativeWindowValues(const WindowAttributes &attributes);

} // namespace penwick::platform
