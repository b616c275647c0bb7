// SPDX-License-Identifier: MIT
#include "platform/window/LayerCall.h"

#include <QEvent>
#include <QWindow>

namespace penwick::platform {

void LayerCall::listen(QWindow *panel)
{
    if (m_panel)
        m_panel->removeEventFilter(this);
    m_panel = panel;
    if (m_panel)
        m_panel->installEventFilter(this);
}

// The layer is called for be it active already: the toolkit hears late that it no longer is.
bool LayerCall::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::TabletPress:
    case QEvent::TouchBegin:
        Q_EMIT called();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

} // namespace penwick::platform
