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

namespace {

bool isReturn(const QKeyEvent &press)
{
    return press.key() == Qt::Key_Return || press.key() == Qt::Key_Enter;
}

} // namespace

void endEditIn(QTextEdit &editor)
{
    commitCompositionIn(editor);
    clearSelectionIn(editor);
    editor.document()->clearUndoRedoStacks();
    closeMenuOf(editor);
}

void prepareForPress(QTextEdit &editor, const QMouseEvent &press)
{
    if (press.button() == Qt::RightButton)
        return;
    commitCompositionIn(editor);
    // A press with Shift alone extends the selection; the editor does that itself.
    if (press.button() == Qt::LeftButton && press.modifiers() != Qt::ShiftModifier)
        editor.setTextCursor(editor.cursorForPosition(press.position().toPoint()));
}

void clearSelectionIn(QTextEdit &editor)
{
    QTextCursor cursor = editor.textCursor();
    cursor.clearSelection();
    editor.setTextCursor(cursor);
}

QString typedBy(const QKeyEvent &press)
{
    if (isReturn(press))
        return QStringLiteral("\n");
    const QString text = press.text();
    if (text.isEmpty())
        return text;
    const QChar first = text.front();
    const auto modifiers = press.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier);
    // Some keyboards write marks of the text's direction with Ctrl and Shift, so these marks are
    // text whatever the modifiers. Ctrl and Alt together are AltGr, which writes; Ctrl alone is a
    // command.
    const bool isWritten = first.category() == QChar::Other_Format
        || (modifiers != Qt::ControlModifier
            && (first.isPrint() || first.category() == QChar::Other_PrivateUse));
    return isWritten ? text : QString();
}

bool endsEditing(const QKeyEvent &press)
{
    return (isReturn(press) && !press.modifiers().testFlag(Qt::ShiftModifier))
        || press.key() == Qt::Key_Tab || press.key() == Qt::Key_Backtab
        || press.key() == Qt::Key_Escape;
}

bool redoIfAsked(QTextEdit &editor, QKeyEvent &press)
{
    // Where the desktop redoes by another key, the editor would leave Ctrl+Y to the canvas.
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
