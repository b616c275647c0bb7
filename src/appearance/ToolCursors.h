// SPDX-License-Identifier: MIT
// The cursors of the tools.
#pragma once

#include "platform/view/Cursor.h"

#include <QString>

namespace penwick {

/// A new cursor with the bundle's image called `cursor_type`. Its hot spot is that of CursorHotspot
/// for the four tool cursors, (0, 0) for any other image. Without a bundle or without that image
/// the process stops.
[[nodiscard]] platform::Cursor getCursorOfType(const QString &cursor_type);

} // namespace penwick
