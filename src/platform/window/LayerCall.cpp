// SPDX-License-Identifier: MIT
#include "platform/window/LayerCall.h"

#include <QEvent>
#include <QWidget>
#include <QWindow>

namespace penwick::platform {

void LayerCall::listen(QWindow &panel, QWidget *layer)
{
    if (m_panel)
        m_panel->removeEventFilter(this);
    m_panel = layer ? &panel : nullptr;
    m_layer = layer;
    if (m_panel)
        m_panel->installEventFilter(this);
}

bool LayerCall::eventFilter(QObject *watched, QEvent *event)
{
    const bool isPress = event->type() == QEvent::MouseButtonPress
        || event->type() == QEvent::TouchBegin || event->type() == QEvent::TabletPress;
    if (isPress && m_layer) { // be it active already: the toolkit hears late that it no longer is
        m_layer->raise();
        m_layer->activateWindow();
    }
    return QObject::eventFilter(watched, event);
}

} // namespace penwick::platform
