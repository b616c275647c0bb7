// SPDX-License-Identifier: MIT
// The increase-contrast setting while portals and the bus come and go.
#include "platform/WorkspaceFixture.h"

#include <QElapsedTimer>

namespace penwick::platform {

TEST_F(WorkspaceTest, keyThatAppearsLaterIsHeard)
{
    const auto portal = startPortal(QStringLiteral("notfound"));
    makeWorkspace();
    settle();

    portal->tell(QStringLiteral("change uint:1"));

    EXPECT_TRUE(waitForValues({ true }));
}

TEST_F(WorkspaceTest, strangerOnTheBusIsNotBelieved)
{
    const auto portal = startPortal(QStringLiteral("uint:0"));
    const auto strangerName = QStringLiteral("org.example.Stranger");
    const auto stranger = startPortal(QStringLiteral("uint:1"), strangerName);
    makeWorkspace();
    settle();

    stranger->tell(QStringLiteral("change uint:1"));
    settle(strangerName);

    EXPECT_EQ(m_values, std::vector<bool> {});
}

TEST_F(WorkspaceTest, absentPortalIsNormalContrast)
{
    makeWorkspace();
    settle(QStringLiteral("org.freedesktop.DBus"));

    EXPECT_EQ(m_values, std::vector<bool> {});
    EXPECT_FALSE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
}

TEST_F(WorkspaceTest, portalThatAppearsLaterIsRead)
{
    makeWorkspace();
    settle(QStringLiteral("org.freedesktop.DBus"));

    const auto portal = startPortal(QStringLiteral("uint:1"));

    EXPECT_TRUE(waitForValues({ true }));
}

TEST_F(WorkspaceTest, restartedPortalIsReadAgainAndHeard)
{
    auto portal = startPortal(QStringLiteral("uint:1"));
    makeWorkspace();
    ASSERT_TRUE(waitForValues({ true }));

    portal->end();
    settle(QStringLiteral("org.freedesktop.DBus"));
    EXPECT_EQ(m_values, std::vector<bool> { true }) << "the value is kept while no portal runs";
    portal = startPortal(QStringLiteral("uint:0"));
    ASSERT_TRUE(waitForValues({ true, false }));
    portal->tell(QStringLiteral("change uint:1"));

    EXPECT_TRUE(waitForValues({ true, false, true }));
}

TEST_F(WorkspaceTest, busThatEndsLeavesTheLastValue)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    makeWorkspace();
    ASSERT_TRUE(waitForValues({ true }));

    m_daemon->end();
    ASSERT_TRUE(waitUntil([this] { return !m_bus.isConnected(); }));

    EXPECT_EQ(m_values, std::vector<bool> { true });
    EXPECT_TRUE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
}

TEST_F(WorkspaceTest, busThatDoesNotAnswerIsNotWaitedFor)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    m_daemon->signal(SIGSTOP);
    QElapsedTimer timer;
    timer.start();

    makeWorkspace();
    const qint64 elapsed = timer.elapsed();
    m_daemon->signal(SIGCONT);

    EXPECT_LT(elapsed, patienceMilliseconds / 2);
    EXPECT_TRUE(waitForValues({ true }));
}

TEST_F(WorkspaceTest, unusableAddressIsNormalContrast)
{
    const auto name = QStringLiteral("workspace-test-unusable");
    m_workspace = std::make_unique<Workspace>(std::make_unique<SettingsPortal>(
        QDBusConnection::connectToBus(QStringLiteral("unix:path=/nonexistent/bus"), name)));
    QCoreApplication::processEvents();

    EXPECT_FALSE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
    QDBusConnection::disconnectFromBus(name);
}

} // namespace penwick::platform
