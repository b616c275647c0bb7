// SPDX-License-Identifier: MIT
// A private bus with a portal in a process of its own, for the tests of the workspace.
#pragma once

#include "platform/native/SettingsPortal.h"
#include "platform/view/Workspace.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

#include <gtest/gtest.h>

#include <csignal>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <sys/prctl.h>

namespace penwick::platform {

inline constexpr int patienceMilliseconds = 10000;
inline const auto portalService = QStringLiteral("org.freedesktop.portal.Desktop");

/// A child process that does not outlive this one.
class Child final
{
public:
    explicit Child(const QString &program, const QStringList &arguments)
    {
        m_process.setChildProcessModifier([] { prctl(PR_SET_PDEATHSIG, SIGKILL); });
        m_process.start(program, arguments);
    }

    ~Child() { end(); }

    void end()
    {
        if (m_process.state() == QProcess::NotRunning)
            return;
        kill(static_cast<pid_t>(m_process.processId()), SIGCONT);
        m_process.kill();
        m_process.waitForFinished(patienceMilliseconds);
    }

    void signal(int number) { kill(static_cast<pid_t>(m_process.processId()), number); }

    /// The next line it prints, or why there is none.
    QString line()
    {
        while (!m_process.canReadLine()) {
            if (!m_process.waitForReadyRead(patienceMilliseconds))
                return m_process.errorString();
        }
        return QString::fromUtf8(m_process.readLine()).trimmed();
    }

    QString tell(const QString &order)
    {
        m_process.write(order.toUtf8() + '\n');
        return line();
    }

private:
    QProcess m_process;
};

/// Everything that Qt prints while it lives.
class MessageCatcher final
{
public:
    MessageCatcher()
    {
        s_messages.clear();
        m_previous = qInstallMessageHandler(
            [](QtMsgType, const QMessageLogContext &, const QString &text) {
                s_messages.push_back(text.toStdString());
            });
    }
    ~MessageCatcher() { qInstallMessageHandler(m_previous); }
    MessageCatcher(const MessageCatcher &) = delete;
    MessageCatcher &operator=(const MessageCatcher &) = delete;

    static const std::vector<std::string> &messages() { return s_messages; }

private:
    static inline std::vector<std::string> s_messages;
    QtMessageHandler m_previous = nullptr;
};

/// A bus of its own, a portal that obeys, and a workspace that listens.
class WorkspaceTest : public testing::Test
{
protected:
    void SetUp() override
    {
        // Of its own, so that no service of the machine is started on demand.
        QFile configuration(m_directory.filePath(QStringLiteral("bus.conf")));
        ASSERT_TRUE(configuration.open(QIODevice::WriteOnly));
        configuration.write("<busconfig><type>session</type><listen>unix:path="
            + m_directory.filePath(QStringLiteral("bus")).toUtf8()
            + "</listen><auth>EXTERNAL</auth><policy context=\"default\">"
              "<allow send_destination=\"*\"/><allow receive_sender=\"*\"/><allow own=\"*\"/>"
              "</policy></busconfig>");
        configuration.close();
        m_daemon.emplace(QStringLiteral("dbus-daemon"),
            QStringList { QStringLiteral("--config-file=") + configuration.fileName(),
                QStringLiteral("--print-address"), QStringLiteral("--nofork") });
        m_address = m_daemon->line();
        ASSERT_TRUE(m_address.startsWith(QStringLiteral("unix:")))
            << "dbus-daemon: " << m_address.toStdString();
        m_bus = QDBusConnection::connectToBus(m_address, busName());
        ASSERT_TRUE(m_bus.isConnected());
    }

    void TearDown() override
    {
        m_workspace.reset();
        m_bus = QDBusConnection(QString());
        QDBusConnection::disconnectFromBus(busName());
        EXPECT_EQ(MessageCatcher::messages(), std::vector<std::string> {});
    }

    static QString busName() { return QStringLiteral("workspace-test"); }

    std::unique_ptr<Child> startPortal(const QString &value, const QString &name = portalService)
    {
        auto portal = std::make_unique<Child>(
            QStringLiteral(PENWICK_FAKE_SETTINGS_PORTAL), QStringList { m_address, name, value });
        EXPECT_EQ(portal->line(), QStringLiteral("ready"));
        return portal;
    }

    void makeWorkspace()
    {
        m_workspace = std::make_unique<Workspace>(std::make_unique<SettingsPortal>(m_bus));
        m_workspace->notificationCenter().addObserver(
            this, QString(), [this](const Notification &notification) {
                m_notifications.push_back(notification);
                m_values.push_back(m_workspace->accessibilityDisplayShouldIncreaseContrast());
            });
    }

    /// Waits until everything that was sent to us before now has been delivered. The bus keeps the
    /// order between two peers, so the answer to a question comes after all of it.
    void settle(const QString &peer = portalService)
    {
        auto question = QDBusMessage::createMethodCall(peer, QStringLiteral("/"),
            QStringLiteral("org.freedesktop.DBus.Peer"), QStringLiteral("Ping"));
        const QDBusPendingCallWatcher watcher(m_bus.asyncCall(question));
        bool isAnswered = false;
        QObject::connect(&watcher, &QDBusPendingCallWatcher::finished, &watcher,
            [&isAnswered] { isAnswered = true; });
        EXPECT_TRUE(waitUntil([&isAnswered] { return isAnswered; }));
    }

    template <typename Condition>
    static bool waitUntil(Condition condition)
    {
        return QTest::qWaitFor(condition, patienceMilliseconds);
    }

    bool waitForValues(const std::vector<bool> &values)
    {
        return waitUntil([&] { return m_values.size() >= values.size(); }) && m_values == values;
    }

    QTemporaryDir m_directory;
    const MessageCatcher m_catcher;
    std::optional<Child> m_daemon;
    QString m_address;
    QDBusConnection m_bus = QDBusConnection(QString());
    std::unique_ptr<Workspace> m_workspace;
    std::vector<Notification> m_notifications;
    std::vector<bool> m_values; // of the setting, as each notification found it
};

} // namespace penwick::platform
