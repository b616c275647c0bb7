// SPDX-License-Identifier: MIT
#include "platform/native/SettingsPortal.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusServiceWatcher>
#include <QDBusVariant>
#include <QDeadlineTimer>
#include <QFileInfo>
#include <QScopeGuard>
#include <QThread>
#include <QUrl>

namespace penwick::platform {

namespace {

const auto portalService = QStringLiteral("org.freedesktop.portal.Desktop");
const auto portalPath = QStringLiteral("/org/freedesktop/portal/desktop");
const auto portalInterface = QStringLiteral("org.freedesktop.portal.Settings");
const auto appearanceNamespace = QStringLiteral("org.freedesktop.appearance");
const auto contrastKey = QStringLiteral("contrast");
constexpr uint increasedContrast = 1; // 0 is no preference, other numbers are to be read as 0
constexpr int exitPatienceMilliseconds = 1000;

/// True only for the one value that asks for more contrast. Read() answers a variant in a variant.
bool asksForContrast(QVariant value)
{
    while (value.metaType() == QMetaType::fromType<QDBusVariant>())
        value = value.value<QDBusVariant>().variant();
    return value.metaType() == QMetaType::fromType<uint>() && value.toUInt() == increasedContrast;
}

/// Address of the bus that logind and systemd give a user; empty where there is none.
QString userBusAddress()
{
    const QString runtimeDirectory = qEnvironmentVariable("XDG_RUNTIME_DIR");
    const QString socket = runtimeDirectory + QStringLiteral("/bus");
    if (runtimeDirectory.isEmpty() || !QFileInfo::exists(socket))
        return QString();
    return QStringLiteral("unix:path=")
        + QString::fromLatin1(QUrl::toPercentEncoding(socket, "/", "~"));
}

/// Joins the session's bus, if it runs already; waits for as long as the bus takes.
QDBusConnection joinSessionBus()
{
    const QByteArray address = qgetenv("DBUS_SESSION_BUS_ADDRESS");
    if (!address.isEmpty() && !address.contains("autolaunch:"))
        return QDBusConnection::sessionBus();

    // Without an address the bus library would run dbus-launch, which starts a bus of its own. A
    // guest in somebody's process must not start one, so the only other place where a bus may be is
    // named here.
    const QString userBus = address.isEmpty() ? userBusAddress() : QString();
    if (userBus.isEmpty())
        return QDBusConnection(QString());
    return QDBusConnection::connectToBus(userBus, QStringLiteral("penwick-workspace"));
}

/// Joins the session's bus away from the GUI thread.
///
/// Joining is a conversation with the bus: a millisecond or two, but without end if the bus hangs.
class SessionBusThread final : public QThread
{
public:
    /// To be read after the thread has finished.
    [[nodiscard]] const QDBusConnection &bus() const { return m_bus; }

private:
    void run() override { m_bus = joinSessionBus(); }

    QDBusConnection m_bus = QDBusConnection(QString());
};

} // namespace

std::unique_ptr<ContrastSource> makeContrastSource()
{
    return std::make_unique<SettingsPortal>();
}

SettingsPortal::SettingsPortal()
{
    // Never destroyed: a thread that still runs must not be.
    static auto *const thread = new SessionBusThread;
    connect(thread, &QThread::finished, this, [this] { listenTo(thread->bus()); });
    thread->start();

    // At the process's end the thread should not be caught inside Qt's bus manager: the manager is
    // made first, so that it is still there while the thread is waited for.
    static_cast<void>(QDBusConnection(QStringLiteral("penwick-none")));
    static const auto waitAtExit
        = qScopeGuard([] { thread->wait(QDeadlineTimer(exitPatienceMilliseconds)); });
}

SettingsPortal::SettingsPortal(const QDBusConnection &bus)
{
    listenTo(bus);
}

void SettingsPortal::listenTo(const QDBusConnection &bus)
{
    if (!bus.isConnected())
        return;
    m_bus = bus;

    // A portal that starts or restarts may have another value.
    auto *watcher = new QDBusServiceWatcher(
        portalService, m_bus, QDBusServiceWatcher::WatchForOwnerChange, this);
    connect(watcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
        [this](const QString &, const QString &, const QString &portal) {
            m_portal = portal;
            if (!portal.isEmpty())
                readContrast();
        });

    // No service is named: Qt would ask the bus who owns that name and wait for the answer.
    // onSettingChanged() looks at the sender instead.
    m_bus.connect(QString(), portalPath, portalInterface, QStringLiteral("SettingChanged"),
        { appearanceNamespace, contrastKey }, QStringLiteral("ssv"), this,
        SLOT(onSettingChanged(QDBusMessage)));

    askWhoThePortalIs();
    readContrast();
}

void SettingsPortal::askWhoThePortalIs()
{
    // The bus is asked who owns the name, because a reply of the portal's tells its sender under Qt
    // 6.4, but no longer under 6.8.
    const auto bus = QStringLiteral("org.freedesktop.DBus");
    auto call = QDBusMessage::createMethodCall(
        bus, QStringLiteral("/org/freedesktop/DBus"), bus, QStringLiteral("GetNameOwner"));
    call << portalService;
    auto *watcher = new QDBusPendingCallWatcher(m_bus.asyncCall(call), this);
    connect(watcher, &QDBusPendingCallWatcher::finished, this, [this, watcher] {
        watcher->deleteLater();
        const QDBusPendingReply<QString> reply = *watcher;
        if (reply.isValid()) // otherwise none runs yet
            m_portal = reply.value();
    });
}

void SettingsPortal::readContrast()
{
    auto call = QDBusMessage::createMethodCall(
        portalService, portalPath, portalInterface, QStringLiteral("Read"));
    call << appearanceNamespace << contrastKey;
    auto *watcher = new QDBusPendingCallWatcher(m_bus.asyncCall(call), this);
    connect(watcher, &QDBusPendingCallWatcher::finished, this, &SettingsPortal::onContrastRead);
}

void SettingsPortal::onContrastRead(QDBusPendingCallWatcher *call)
{
    call->deleteLater();
    // An error (no portal, no such key) carries its text as argument, never a number.
    Q_EMIT told(asksForContrast(call->reply().arguments().value(0)));
}

void SettingsPortal::onSettingChanged(const QDBusMessage &message)
{
    // A change that is sent before the portal is known is ignored here. The portal's answer to
    // readContrast(), which comes later, has it.
    if (message.service() == m_portal)
        Q_EMIT told(asksForContrast(message.arguments().value(2)));
}

} // namespace penwick::platform
