// SPDX-License-Identifier: MIT
#include "textbox/PlacedSelection.h"

#include "textbox/TextSelection.h"

#include <QCoreApplication>
#include <QEvent>
#include <QScrollBar>
#include <QTextEdit>

namespace penwick {

namespace {

/// Whether `object` is the editor or inside it. The editor's menu, a window of its own, is inside.
bool belongsTo(const QTextEdit &editor, const QObject *object)
{
    while (object && object != &editor)
        object = object->parent();
    return object;
}

} // namespace

PlacedSelection::PlacedSelection(QTextEdit &editor)
    : m_editor(editor)
{
    connect(&editor, &QTextEdit::selectionChanged, this, &PlacedSelection::listenIfNeeded);
}

void PlacedSelection::listenIfNeeded()
{
    if (m_editor.isReadOnly() && m_editor.textCursor().hasSelection())
        QCoreApplication::instance()->installEventFilter(this);
    else
        QCoreApplication::instance()->removeEventFilter(this);
}

bool PlacedSelection::eventFilter(QObject *watched, QEvent *event)
{
    // A pen's press reaches a QWindow first and then a widget; only the widget tells what it is on.
    const bool isPress
        = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::TabletPress;
    if (!isPress || !watched->isWidgetType() || belongsTo(m_editor, watched))
        return false;
    QScrollBar &scroll = *m_editor.verticalScrollBar();
    const int seen = scroll.value();
    clearSelectionIn(m_editor);
    scroll.setValue(seen); // clearing has scrolled to the caret, which a placed box does not show
    return false;
}

} // namespace penwick
