// SPDX-License-Identifier: MIT
#include "textbox/TextEditing.h"

#include "textbox/TextComposition.h"

#include <QKeyEvent>
#include <QMenu>
#include <QMouseEvent>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextEdit>

namespace penwick {

void endEditIn(QTextEdit &editor)
{
    commitCompositionIn(editor);
    QTextCursor cursor = editor.textCursor();
    cursor.clearSelection();
    editor.setTextCursor(cursor);
    editor.document()->clearUndoRedoStacks();
    closeMenuOf(editor);
}

void prepareForPress(QTextEdit &editor, const QMouseEvent &press)
{
    if (press.button() == Qt::RightButton)
        return;
    commitCompositionIn(editor);
    // Shift alone makes the selection longer.
    if (press.button() == Qt::LeftButton && press.modifiers() != Qt::ShiftModifier)
        editor.setTextCursor(editor.cursorForPosition(press.position().toPoint()));
}

bool endsEditing(const QKeyEvent &press)
{
    const bool isReturn = press.key() == Qt::Key_Return || press.key() == Qt::Key_Enter;
    return (isReturn && !press.modifiers().testFlag(Qt::ShiftModifier))
        || press.key() == Qt::Key_Tab || press.key() == Qt::Key_Backtab
        || press.key() == Qt::Key_Escape;
}

bool redoIfAsked(QTextEdit &editor, QKeyEvent &press)
{
    // Where the desktop has other keys for it, the editor would leave these to the canvas.
    if (editor.isReadOnly() || press.keyCombination() != (Qt::ControlModifier | Qt::Key_Y))
        return false;
    press.accept();
    editor.redo();
    return true;
}

void closeMenuOf(const QTextEdit &editor)
{
    for (QMenu *const menu : editor.findChildren<QMenu *>())
        menu->close();
}

} // namespace penwick
