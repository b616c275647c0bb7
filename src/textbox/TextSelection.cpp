// SPDX-License-Identifier: MIT
#include "textbox/TextSelection.h"

#include <QTextCursor>
#include <QTextEdit>

namespace penwick {

void clearSelectionIn(QTextEdit &editor)
{
    QTextCursor cursor = editor.textCursor();
    cursor.clearSelection();
    editor.setTextCursor(cursor);
}

} // namespace penwick
