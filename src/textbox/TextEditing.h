// SPDX-License-Identifier: MIT
// What an editor does beyond the toolkit's own when it is pressed, typed in, and left.
#pragma once

#include <QString>

class QKeyEvent;
class QMouseEvent;
class QTextEdit;

namespace penwick {

/// Ends an edit: a composition becomes text, nothing stays selected, the next edit cannot undo this
/// one, and the editor's menu closes, because what it offers is not possible any more.
void endEditIn(QTextEdit &editor);

/// To be called before the editor hears of a press; the right button, which opens the menu, changes
/// nothing. A composition becomes text, because the editor would count positions as if it were text
/// already. The left button puts the caret where it is pressed, which clears the selection: the
/// editor would drag selected text in an event loop of its own, in which the host may end the
/// session.
void prepareForPress(QTextEdit &editor, const QMouseEvent &press);

/// Clears the selection; the caret stays where it is.
void clearSelectionIn(QTextEdit &editor);

/// The text that `press` would write; empty if it is a command.
[[nodiscard]] QString typedBy(const QKeyEvent &press);

/// Whether `press` is one of the keys that end an edit: Return without Shift, Tab and Escape.
[[nodiscard]] bool endsEditing(const QKeyEvent &press);

/// If `press` is Ctrl+Y and `editor` is editable: accepts it, redoes, and returns true.
bool redoIfAsked(QTextEdit &editor, QKeyEvent &press);

/// Closes the menu of `editor`, if it is open. A menu is a window of its own: left alone, it would
/// stay on the screen when its editor goes.
void closeMenuOf(const QTextEdit &editor);

} // namespace penwick
