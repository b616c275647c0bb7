// SPDX-License-Identifier: MIT
// What a window is like.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QColor>
#include <QFlags>

#include <optional>

namespace penwick::platform {

/// What a window has around its content. Flags.
enum class StyleMask : unsigned
{
    titled = 1,
    closable = 2,
    miniaturizable = 4,
    resizable = 8,
    unifiedTitleAndToolbar = 4096,
    fullSizeContentView = 32768 ///< the content reaches under the title bar
};
Q_DECLARE_FLAGS(StyleMasks, StyleMask)
Q_DECLARE_OPERATORS_FOR_FLAGS(StyleMasks)

/// How a window behaves on virtual desktops and beside windows that fill the screen. Flags.
enum class CollectionBehavior : unsigned
{
    canJoinAllSpaces = 1, ///< it is on all virtual desktops
    fullScreenAuxiliary = 256 ///< it may stand beside a window that fills the screen
};
Q_DECLARE_FLAGS(CollectionBehaviors, CollectionBehavior)
Q_DECLARE_OPERATORS_FOR_FLAGS(CollectionBehaviors)

/// Windows of a higher level stand above those of a lower one.
enum class WindowLevel : int
{
    normal = 0,
    mainMenu = 24 ///< above docks too
};

/// Who may see what a window holds.
enum class SharingType : unsigned
{
    none = 0, ///< not to be seen by a capture of the screen
    readOnly = 1
};

enum class TitleVisibility : unsigned
{
    visible = 0,
    hidden = 1
};

/// How a window appears and disappears.
enum class AnimationBehavior : int
{
    byDefault = 0,
    utilityWindow = 4,
    alertPanel = 5
};

/// What a window is like. Each value is kept as it is set; a value that the desktop does not know
/// has no effect there. The enumerations have AppKit's raw values.
struct WindowAttributes
{
    StyleMasks styleMask = StyleMask::titled | StyleMask::closable | StyleMask::miniaturizable;
    CollectionBehaviors collectionBehavior;
    WindowLevel level = WindowLevel::normal;
    SharingType sharingType = SharingType::readOnly;
    TitleVisibility titleVisibility = TitleVisibility::visible;
    AnimationBehavior animationBehavior = AnimationBehavior::byDefault;
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
