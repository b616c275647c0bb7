// SPDX-License-Identifier: MIT
// What a window is like.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QColor>

#include <optional>

namespace penwick::platform {

/// Bits of a window's style mask.
namespace StyleMask {
constexpr unsigned titled = 1;
constexpr unsigned closable = 2;
constexpr unsigned miniaturizable = 4;
constexpr unsigned resizable = 8;
constexpr unsigned unifiedTitleAndToolbar = 4096;
constexpr unsigned fullSizeContentView = 32768;
} // namespace StyleMask

/// What a window is like. Each value is kept as it is set; a value that the desktop does not know
/// has no effect there.
struct WindowAttributes
{
    unsigned styleMask = StyleMask::titled | StyleMask::closable | StyleMask::miniaturizable;
    unsigned collectionBehavior = 0; ///< 1: on all virtual desktops; 256: beside full screen
    int level = 0; ///< 0: an ordinary window; above 0: over those
    unsigned sharingType = 1; ///< 0: not to be seen by a capture of the screen
    unsigned titleVisibility = 0; ///< 1: hidden
    int animationBehavior = 0;
    bool titlebarAppearsTransparent = false;
    bool hasShadow = true;
    bool isOpaque = true;
    bool ignoresMouseEvents = false;
    bool isMovable = true;
    bool isMovableByWindowBackground = false; ///< dragged wherever no view takes the pointer
    bool showsToolbarButton = false;
    QColor backgroundColor = Qt::white;
    std::optional<Size> aspectRatio; ///< of the frame, kept while the user resizes

    friend bool operator==(const WindowAttributes &, const WindowAttributes &) = default;
};

} // namespace penwick::platform
