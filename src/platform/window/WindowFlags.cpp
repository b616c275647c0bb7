// SPDX-License-Identifier: MIT
#include "platform/window/WindowFlags.h"

namespace penwick::platform {

namespace {

// A title bar that is hidden, transparent and lies over the content leaves nothing of itself.
bool hasVisibleTitleBar(const WindowAttributes &attributes)
{
    if (!canBecomeKey(attributes))
        return false;
    return !((attributes.styleMask & StyleMask::fullSizeContentView)
        && attributes.titlebarAppearsTransparent && attributes.titleVisibility == 1);
}

} // namespace

bool canBecomeKey(const WindowAttributes &attributes)
{
    return (attributes.styleMask & StyleMask::titled) != 0;
}

Qt::WindowFlags windowFlagsFor(const WindowAttributes &attributes)
{
    Qt::WindowFlags flags = Qt::CustomizeWindowHint;
    flags |= canBecomeKey(attributes) ? Qt::Window : Qt::Tool | Qt::WindowDoesNotAcceptFocus;
    if (hasVisibleTitleBar(attributes))
        flags |= Qt::WindowTitleHint | Qt::WindowSystemMenuHint;
    else
        flags |= Qt::FramelessWindowHint;
    if (attributes.styleMask & StyleMask::closable)
        flags |= Qt::WindowCloseButtonHint;
    if (attributes.styleMask & StyleMask::miniaturizable)
        flags |= Qt::WindowMinimizeButtonHint;
    if (attributes.styleMask & StyleMask::resizable)
        flags |= Qt::WindowMaximizeButtonHint;
    if (attributes.level > 0)
        flags |= Qt::WindowStaysOnTopHint;
    if (!attributes.hasShadow)
        flags |= Qt::NoDropShadowWindowHint;
    if (attributes.ignoresMouseEvents)
        flags |= Qt::WindowTransparentForInput;
    return flags;
}

} // namespace penwick::platform
