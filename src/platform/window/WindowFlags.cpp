// SPDX-License-Identifier: MIT
#include "platform/window/WindowFlags.h"

namespace penwick::platform {

namespace {

// A title bar that is hidden, transparent and lies over the content leaves nothing of itself.
bool hasVisibleTitleBar(const WindowAttributes &attributes)
{
    if (!canBecomeKey(attributes))
        return false;
    return !(attributes.styleMask.testFlag(StyleMask::fullSizeContentView)
        && attributes.titlebarAppearsTransparent
        && attributes.titleVisibility == TitleVisibility::hidden);
}

bool isLayer(const WindowAttributes &attributes)
{
    return canBecomeKey(attributes) && !hasVisibleTitleBar(attributes)
        && attributes.level > WindowLevel::normal;
}

} // namespace

bool canBecomeKey(const WindowAttributes &attributes)
{
    return attributes.styleMask.testFlag(StyleMask::titled);
}

Qt::WindowFlags windowFlagsFor(const WindowAttributes &attributes)
{
    Qt::WindowFlags flags = Qt::CustomizeWindowHint;
    flags |= canBecomeKey(attributes) ? Qt::Window : Qt::Tool | Qt::WindowDoesNotAcceptFocus;
    if (hasVisibleTitleBar(attributes))
        flags |= Qt::WindowTitleHint | Qt::WindowSystemMenuHint;
    else
        flags |= Qt::FramelessWindowHint;
    if (attributes.styleMask.testFlag(StyleMask::closable))
        flags |= Qt::WindowCloseButtonHint;
    if (attributes.styleMask.testFlag(StyleMask::miniaturizable))
        flags |= Qt::WindowMinimizeButtonHint;
    if (attributes.styleMask.testFlag(StyleMask::resizable))
        flags |= Qt::WindowMaximizeButtonHint;
    if (attributes.level > WindowLevel::normal)
        flags |= Qt::WindowStaysOnTopHint;
    if (!attributes.hasShadow)
        flags |= Qt::NoDropShadowWindowHint;
    if (attributes.ignoresMouseEvents)
        flags |= Qt::WindowTransparentForInput;
    return flags;
}

WindowStanding standingOf(const WindowAttributes &attributes, const WindowAttributes *below)
{
    WindowStanding standing;
    standing.isOnAllDesktops
        = attributes.collectionBehavior.testFlag(CollectionBehavior::canJoinAllSpaces);
    standing.isPanel = !canBecomeKey(attributes);
    standing.isLayer = isLayer(attributes);
    standing.isUnmanaged = standing.isPanel && below && isLayer(*below);
    return standing;
}

} // namespace penwick::platform
