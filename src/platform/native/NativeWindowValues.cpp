// SPDX-License-Identifier: MIT
#include "platform/native/NativeWindowValues.h"

namespace penwick::platform {

namespace {

constexpr unsigned canJoinAllSpaces = 1; // of the collection behaviour
constexpr unsigned sharedWithNobody = 0; // of the sharing type

} // namespace

NativeWindowValues nativeWindowValues(const WindowAttributes &attributes)
{
    NativeWindowValues values;
    values.styleMask = attributes.styleMask;
    values.collectionBehavior = attributes.collectionBehavior;
    values.level = attributes.level;
    values.sharingType = attributes.sharingType;
    values.titleVisibility = static_cast<long>(attributes.titleVisibility);
    values.animationBehavior = attributes.animationBehavior;
    values.titlebarAppearsTransparent = attributes.titlebarAppearsTransparent;
    values.hasShadow = attributes.hasShadow;
    values.isOnAllDesktops = (attributes.collectionBehavior & canJoinAllSpaces) != 0;
    values.isLeftOutOfCaptures = attributes.sharingType == sharedWithNobody;
    return values;
}

} // namespace penwick::platform
