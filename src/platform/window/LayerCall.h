// SPDX-License-Identifier: MIT
// A press on a panel calls for the layer that it belongs to.
#pragma once

#include <QObject>
#include <QPointer>

class QWindow;

namespace penwick::platform {

/// For panels that no window manager orders. They stay in reach where the desktop has put another
/// program's full screen above the layer; who presses one wants to see the layer again, and to
/// have its keys.
class LayerCall final : public QObject
{
    Q_OBJECT

public:
    /// From now on presses on `panel` call; none do if that is null. The panel may go at any time.
    void listen(QWindow *panel);

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    void called();

private:
    QPointer<QWindow> m_panel;
};

} // namespace penwick::platform
