// SPDX-License-Identifier: MIT
// What a key means to the editor of a text box.
#pragma once

#include <QString>

class QKeyEvent;

namespace penwick {

/// The text that `press` would write; empty if it is a command.
[[nodiscard]] QString typedBy(const QKeyEvent &press);

/// Whether `press` is one of the keys that end an edit: Return without Shift, Tab and Escape.
[[nodiscard]] bool endsEditing(const QKeyEvent &press);

/// Whether `press` is Ctrl+Y. Where the desktop redoes by another key, the toolkit's editor would
/// leave it to the canvas.
[[nodiscard]] bool asksForRedo(const QKeyEvent &press);

} // namespace penwick
