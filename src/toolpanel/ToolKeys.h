// SPDX-License-Identifier: MIT
// The keys that work the tool bar while the drawing window has them.
#pragma once

#include <QString>

class QKeyEvent;

namespace penwick {

/// The identifier of the tool bar button that the key stands for; empty for any other key.
///
/// Plain letters choose tools (B, T, E, C), the desktop's own keys undo and redo, Ctrl+Delete
/// clears and the desktop's key for closing a window ends the session. While text is being edited
/// the editor has all of them first.
[[nodiscard]] QString toolForKey(const QKeyEvent &event);

/// Whether the key types a letter or a digit, so that it may be meant for a text.
[[nodiscard]] bool isTyped(const QKeyEvent &event);

/// Which option of an open popover the key stands for: 0 for "1" up to 8 for "9"; -1 for any other
/// key.
[[nodiscard]] int optionForKey(const QKeyEvent &event);

} // namespace penwick
