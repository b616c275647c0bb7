// SPDX-License-Identifier: MIT
// The desktop's increase-contrast setting and the news that it changed.
// Asked of the desktop's settings portal, so that one source serves every desktop that has one.
#pragma once

#include <penwick/platform/NotificationCenter.h>

#include <QObject>

#include <memory>

class QDBusConnection;
class QDBusMessage;
class QDBusPendingCallWatcher;

namespace penwick::platform {

/// What the component wants to know about the user's desktop.
///
/// Nothing here waits for the bus: until the portal has answered, and wherever there is no bus, no
/// portal or no such setting, contrast is normal, and nothing is printed. GUI thread only.
class Workspace final : public QObject
{
    Q_OBJECT

public:
    /// The workspace of the user's session; made on first use, never destroyed. Connects in the
    /// background and never starts a bus where none is running.
    static Workspace &shared();

    /// Listens on `bus`, which may be unconnected.
    explicit Workspace(const QDBusConnection &bus, QObject *parent = nullptr);
    ~Workspace() override;

    /// Name of the notification posted by notificationCenter() when the value of
    /// accessibilityDisplayShouldIncreaseContrast() has changed; its object is the workspace as a
    /// QObject pointer. The spelling is fixed.
    [[nodiscard]] static QString accessibilityDisplayOptionsDidChangeNotification();

    /// The last value that the desktop told. Kept while a portal restarts, or when the bus is lost.
    [[nodiscard]] bool accessibilityDisplayShouldIncreaseContrast() const;

    /// The workspace's own centre, apart from the process's default one. Posts from the event loop,
    /// never from inside a call to the workspace.
    [[nodiscard]] NotificationCenter &notificationCenter();

private Q_SLOTS:
    void onSettingChanged(const QDBusMessage &message);

private:
    Workspace();

    void listenTo(const QDBusConnection &bus);
    void askWhoThePortalIs();
    void readContrast();
    void onContrastRead(QDBusPendingCallWatcher *call);
    void setContrastIncreased(bool isIncreased);

    const std::unique_ptr<QDBusConnection> m_bus; // so that this header needs no QtDBus
    QString m_portal; // unique bus name of the portal that runs; only its changes count
    bool m_isContrastIncreased = false;
    NotificationCenter m_notificationCenter;
};

} // namespace penwick::platform
