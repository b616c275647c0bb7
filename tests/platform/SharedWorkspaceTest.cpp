// SPDX-License-Identifier: MIT
// The process's own workspace: which bus it joins, and that it starts none.
#include "platform/WorkspaceFixture.h"

#include <cstdio>
#include <cstdlib>

namespace penwick::platform {

/// The process's own workspace, each time in a process of its own, since there is only one.
/// The child process reports on standard error, where a warning of Qt's would spoil the report.
class SharedWorkspaceDeathTest : public WorkspaceTest
{
protected:
    void SetUp() override
    {
        GTEST_FLAG_SET(death_test_style, "threadsafe");
        WorkspaceTest::SetUp();
        // Without one, the child's application would complain about it where the report stands.
        qputenv("XDG_RUNTIME_DIR", m_directory.path().toUtf8());
    }

    void TearDown() override
    {
        if (m_runtimeDirectory.isNull())
            qunsetenv("XDG_RUNTIME_DIR");
        else
            qputenv("XDG_RUNTIME_DIR", m_runtimeDirectory);
        WorkspaceTest::TearDown();
    }

    /// Sees that dbus-launch would be found, but leaves a trace instead of starting a bus.
    void trapLauncher() const
    {
        QFile launcher(m_directory.filePath(QStringLiteral("dbus-launch")));
        ASSERT_TRUE(launcher.open(QIODevice::WriteOnly));
        launcher.write("#!/bin/sh\necho > \"$0.trace\"\nexit 1\n");
        launcher.close();
        launcher.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        qputenv("PATH", m_directory.path().toUtf8() + ':' + qgetenv("PATH"));
        qputenv("DISPLAY", ":nowhere");
        qputenv("XDG_RUNTIME_DIR", m_directory.filePath(QStringLiteral("none")).toUtf8());
    }

    /// To be called in the child: reports the setting once it is increased, or after a while.
    [[noreturn]] void report(const QByteArray &address)
    {
        qInstallMessageHandler(nullptr);
        qputenv("DBUS_SESSION_BUS_ADDRESS", address);
        Workspace &workspace = Workspace::shared();
        const auto isIncreased
            = [&] { return workspace.accessibilityDisplayShouldIncreaseContrast(); };
        const bool isReached = QTest::qWaitFor(isIncreased, m_reportMilliseconds);
        std::fputs(isReached ? "increased" : "normal", stderr);
        if (QFile::exists(m_directory.filePath(QStringLiteral("dbus-launch.trace"))))
            std::fputs(", and a bus was to be started", stderr);
        leave();
    }

    /// Ends the process in the ordinary way; only the fixture is not torn down then.
    [[noreturn]] void leave()
    {
        m_directory.remove();
        std::exit(0);
    }

    const QByteArray m_runtimeDirectory = qgetenv("XDG_RUNTIME_DIR");
    int m_reportMilliseconds = 200; // nothing is to happen; longer only proves it harder
};

TEST_F(SharedWorkspaceDeathTest, sessionBusIsUsed)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    m_reportMilliseconds = patienceMilliseconds;

    EXPECT_EXIT(report(m_address.toUtf8()), testing::ExitedWithCode(0), "^increased$");
}

TEST_F(SharedWorkspaceDeathTest, busOfTheRuntimeDirectoryIsUsedWithoutAnAddress)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    m_reportMilliseconds = patienceMilliseconds;
    const QByteArray directory = m_directory.path().toUtf8();

    EXPECT_EXIT(
        {
            trapLauncher();
            qputenv("XDG_RUNTIME_DIR", directory);
            report(QByteArray());
        },
        testing::ExitedWithCode(0), "^increased$");
}

TEST_F(SharedWorkspaceDeathTest, noBusIsStartedWithoutAnAddress)
{
    EXPECT_EXIT(
        {
            trapLauncher();
            report(QByteArray());
        },
        testing::ExitedWithCode(0), "^normal$");
}

TEST_F(SharedWorkspaceDeathTest, noBusIsStartedByAnAddressThatAsksForIt)
{
    EXPECT_EXIT(
        {
            trapLauncher();
            report("unix:path=/nonexistent;autolaunch:");
        },
        testing::ExitedWithCode(0), "^normal$");
}

TEST_F(SharedWorkspaceDeathTest, unusableAddressIsSilentlyNormal)
{
    EXPECT_EXIT(report("unix:path=/nonexistent"), testing::ExitedWithCode(0), "^normal$");
}

TEST_F(SharedWorkspaceDeathTest, rubbishAddressIsSilentlyNormal)
{
    EXPECT_EXIT(report("rubbish"), testing::ExitedWithCode(0), "^normal$");
}

TEST_F(SharedWorkspaceDeathTest, processThatEndsAtOnceEndsWell)
{
    const QByteArray address = m_address.toUtf8();

    EXPECT_EXIT(
        {
            qInstallMessageHandler(nullptr);
            qputenv("DBUS_SESSION_BUS_ADDRESS", address);
            Workspace::shared();
            leave();
        },
        testing::ExitedWithCode(0), "^$");
}

} // namespace penwick::platform
