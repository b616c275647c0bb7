// SPDX-License-Identifier: MIT
// The desktop's increase-contrast setting, in a test's hand.
#pragma once

#include "platform/view/Workspace.h"

#include <QDBusMessage>
#include <QDBusVariant>

namespace penwick::test {

/// Tells the process's workspace what the settings portal would tell it. Normal contrast before
/// and after. Must be there before the first button is, so that no bus has been joined.
class ContrastSetting final
{
public:
    ContrastSetting() { qputenv("DBUS_SESSION_BUS_ADDRESS", "unix:path=/nonexistent"); }
    ~ContrastSetting() { setIncreased(false); }
    ContrastSetting(const ContrastSetting &) = delete;
    ContrastSetting &operator=(const ContrastSetting &) = delete;

    static void setIncreased(bool isIncreased)
    {
        auto change = QDBusMessage::createSignal(QStringLiteral("/org/freedesktop/portal/desktop"),
            QStringLiteral("org.freedesktop.portal.Settings"), QStringLiteral("SettingChanged"));
        change << QStringLiteral("org.freedesktop.appearance") << QStringLiteral("contrast")
               << QVariant::fromValue(QDBusVariant(isIncreased ? 1U : 0U));
        QMetaObject::invokeMethod(&platform::Workspace::shared(), "onSettingChanged",
            Qt::DirectConnection, Q_ARG(QDBusMessage, change));
    }
};

} // namespace penwick::test
