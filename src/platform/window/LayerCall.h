// SPDX-License-Identifier: MIT
// A press on a panel of a layer brings the layer forth.
#pragma once

#include <QObject>
#include <QPointer>

class QWidget;
class QWindow;

namespace penwick::platform {

/// For panels that no window manager orders. They stay in reach where the desktop has put another
/// program's full screen above the layer; who presses one wants to see the layer again, and to
/// have its keys.
class LayerCall final : public QObject
{
public:
    /// From now on a press on `panel` calls for `layer`; for nothing if that is null. Ends what was
    /// asked for before. Each may go at any time.
    void listen(QWindow &panel, QWidget *layer);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QPointer<QWindow> m_panel;
    QPointer<QWidget> m_layer;
};

} // namespace penwick::platform
