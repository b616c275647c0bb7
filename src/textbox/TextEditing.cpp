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

void placeCaret(QTextEdit &editor, const QMouseEvent &press)
{
    commitCompositionIn(editor);
    if (!press.modifiers().testFlag(Qt::ShiftModifier))
        editor.setTextCursor(editor.cursorForPosition(press.position().toPoint()));
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
