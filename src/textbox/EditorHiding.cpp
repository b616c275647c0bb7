// SPDX-License-Identifier: MIT
#include "textbox/EditorHiding.h"

#include <QCoreApplication>
#include <QDragLeaveEvent>
#include <QMenu>
#include <QTextEdit>

#include <utility>

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
    switch (event->type()) {
    case QEvent::DragMove: // sent to the drag's target alone
        m_isDraggedOver = true;
        break;
    case QEvent::DragLeave:
    case QEvent::Drop:
        m_isDraggedOver = false;
        break;
    case QEvent::Hide:
        closeMenu();
        if (std::exchange(m_isDraggedOver, false)) {
            QDragLeaveEvent leave;
            QCoreApplication::sendEvent(watched, &leave);
        }
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

} // namespace penwick
