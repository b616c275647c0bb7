// SPDX-License-Identifier: MIT
#include "history/NotificationNames.h"

namespace penwick {

const QString &notificationPrefix()
{
    static const QString &prefix = *new QString(QStringLiteral("org.penwick"));
    return prefix;
}

const QString &penwickNotificationKey()
{
    static const QString &name
        = *new QString(notificationPrefix() + QStringLiteral(".penwik.notification"));
    return name;
}

const QString &drawingViewUpdatedNotification()
{
    static const QString &name = *new QString(
        notificationPrefix() + QStringLiteral(".penwick.notification.drawingview.update"));
    return name;
}

const QString &drawingCanvasSubviewUpdateNotification()
{
    static const QString &name = *new QString(
        notificationPrefix() + QStringLiteral(".penwick.notification.drawsubview.update"));
    return name;
}

} // namespace penwick
