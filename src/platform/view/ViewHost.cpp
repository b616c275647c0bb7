// SPDX-License-Identifier: MIT
#include "platform/view/ViewHost.h"

#include <QWidget>

namespace penwick::platform {

ViewHost *ViewHost::of(const QWidget &widget)
{
    return widget.window()->findChild<ViewHost *>(QString(), Qt::FindDirectChildrenOnly);
}

ViewHost::ViewHost(QWidget &window)
    : QObject(&window)
{ }

ViewHost::~ViewHost() = default;

} // namespace penwick::platform
