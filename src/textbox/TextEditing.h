// SPDX-License-Identifier: MIT
// What an editor does with presses and when an edit ends, beyond the toolkit's own.
#pragma once

#include <QString>

class QKeyEvent;
class QMouseEvent;
class QTextEdit;

namespace penwick {

/// Ends an edit: what is half composed becomes text, nothing stays selected, the next edit cannot
/// undo this one, and a menu that was opened for it closes, because what it offers is not possible
/// any more.
void endEditIn(QTextEdit &editor);

/// Before the editor hears of a press that is no call for the menu: what is half composed becomes
/// text, because the editor would count it as text that it is not yet; and the left button puts the
/// caret where it is pressed, because the editor would drag what is selected in a loop of events of
/// its own, in which the host may end the session.
void prepareForPress(QTextEdit &editor, const QMouseEvent &press);

/// Selects nothing any more; the caret stays.
void clearSelectionIn(QTextEdit &editor);

/// What `press` would write where it is no command of the editor's; empty for those that are.
[[nodiscard]] QString typedBy(const QKeyEvent &press);

/// Whether `press` is one of the keys that end an edit: Return without Shift, Tab and Escape.
[[nodiscard]] bool endsEditing(const QKeyEvent &press);

/// Redoes if `press` is Ctrl+Y and `editor` can be written in; whether it was. The press is
/// accepted then.
bool redoIfAsked(QTextEdit &editor, QKeyEvent &press);

/// Closes the menu of `editor`, if it is open. A menu is a window of its own: left alone, it would
/// stay on the screen when its editor goes.
void closeMenuOf(const QTextEdit &editor);

} // namespace penwick
