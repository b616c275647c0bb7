// SPDX-License-Identifier: MIT
// What a window's attributes mean in Qt's words.
#pragma once

#include "platform/native/WindowStanding.h"

#include <penwick/platform/WindowAttributes.h>

#include <Qt>

namespace penwick::platform {

/// For a window that is on every virtual desktop, and beside another program's full screen.
constexpr CollectionBehaviors everywhere
    = CollectionBehavior::canJoinAllSpaces | CollectionBehavior::fullScreenAuxiliary;

/// Whether the window may get the keys: only one that has a title bar, hidden or not.
[[nodiscard]] bool canBecomeKey(const WindowAttributes &attributes);

/// The window flags, its type included, that `attributes` ask for.
[[nodiscard]] Qt::WindowFlags windowFlagsFor(const WindowAttributes &attributes);

/// How a window with `attributes` stands among others. `below` is what the nearest window that may
/// have the keys is like, of those that it stands above; null where there is none.
[[nodiscard]] WindowStanding standingOf(
    const WindowAttributes &attributes, const WindowAttributes *below);

} // namespace penwick::platform
