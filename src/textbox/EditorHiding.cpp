// SPDX-License-Identifier: MIT
#include "textbox/EditorHiding.h"

#include <QCoreApplication>
#include <QDragLeaveEvent>
#include <QMenu>
#include <QTextEdit>

namespace penwick {

EditorHiding::EditorHiding(QTextEdit &editor)
    : m_editor(editor)
{
    editor.viewport()->installEventFilter(this);
}

void EditorHiding::closeMenu()
{
    for (QMenu *const menu : m_editor.findChildren<QMenu *>())
        menu->close();
}

bool EditorHiding::eventFilter(QObject *watched, QEvent *event)
{
    const QEvent::Type type = event->type();
    if (type == QEvent::DragMove) // sent to the drag's target alone
        m_isDraggedOver = true;
    if (type == QEvent::DragLeave || type == QEvent::Drop)
        m_isDraggedOver = false;
    if (type == QEvent::Hide) {
        closeMenu();
        // Whatever else the drag is over would be told, if it were not over this.
        if (m_isDraggedOver) {
            QDragLeaveEvent leave;
            QCoreApplication::sendEvent(watched, &leave);
        }
    }
    return QObject::eventFilter(watched, event);
}

} // namespace penwick
