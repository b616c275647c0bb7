// SPDX-License-Identifier: MIT
// The settings portal on the session's bus, which desktops under X11 and Wayland have alike.
#pragma once

#include "platform/native/ContrastSource.h"

#include <QDBusConnection>
#include <QString>

class QDBusMessage;
class QDBusPendingCallWatcher;

namespace penwick::platform {

/// Asks the portal for its increase-contrast setting and hears of its changes.
///
/// Nothing here waits for the bus: wherever there is no bus, no portal or no such setting, nothing
/// is told, and nothing is printed. GUI thread only.
class SettingsPortal final : public ContrastSource
{
    Q_OBJECT

public:
    /// Joins the session's bus in the background, and never starts one where none is running.
    /// Made once in a process and not destroyed before its end.
    SettingsPortal();
    /// Listens on `bus`, which may be unconnected.
    explicit SettingsPortal(const QDBusConnection &bus);

private Q_SLOTS:
    void onSettingChanged(const QDBusMessage &message);

private:
    void listenTo(const QDBusConnection &bus);
    void askWhoThePortalIs();
    void readContrast();
    void onContrastRead(QDBusPendingCallWatcher *call);

    QDBusConnection m_bus = QDBusConnection(QString());
    QString m_portal; // unique bus name of the portal that runs; only its changes count
};

} // namespace penwick::platform
