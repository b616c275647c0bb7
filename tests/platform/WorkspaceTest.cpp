// SPDX-License-Identifier: MIT
// The increase-contrast setting, as a portal tells it.
#include "platform/WorkspaceFixture.h"

namespace penwick::platform {

TEST_F(WorkspaceTest, contrastIsNormalUntilThePortalHasAnswered)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));

    makeWorkspace();

    EXPECT_FALSE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
    EXPECT_TRUE(waitForValues({ true }));
}

TEST_F(WorkspaceTest, notificationCarriesItsNameAndTheWorkspace)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));

    makeWorkspace();

    ASSERT_TRUE(waitForValues({ true }));
    EXPECT_EQ(m_notifications.at(0).name,
        QStringLiteral("NSWorkspaceAccessibilityDisplayOptionsDidChangeNotification"));
    EXPECT_EQ(m_notifications.at(0).object.value<QObject *>(), m_workspace.get());
}

TEST_F(WorkspaceTest, defaultCenterHearsNothing)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    int heard = 0;
    NotificationCenter::defaultCenter().addObserver(
        this, QString(), [&heard](const Notification &) { ++heard; });

    makeWorkspace();

    EXPECT_TRUE(waitForValues({ true }));
    NotificationCenter::defaultCenter().removeObserver(this);
    EXPECT_EQ(heard, 0);
}

TEST_F(WorkspaceTest, eachChangeIsNotifiedOnce)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    makeWorkspace();
    ASSERT_TRUE(waitForValues({ true }));

    EXPECT_EQ(portal->tell(QStringLiteral("change uint:0")), QStringLiteral("done"));
    EXPECT_EQ(portal->tell(QStringLiteral("change uint:1")), QStringLiteral("done"));
    settle();

    EXPECT_EQ(m_values, (std::vector<bool> { true, false, true }));
}

TEST_F(WorkspaceTest, unchangedValueIsNotNotified)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    makeWorkspace();
    ASSERT_TRUE(waitForValues({ true }));

    EXPECT_EQ(portal->tell(QStringLiteral("change uint:1")), QStringLiteral("done"));
    settle();

    EXPECT_EQ(m_values, std::vector<bool> { true });
}

TEST_F(WorkspaceTest, normalContrastAtTheStartIsNotNotified)
{
    const auto portal = startPortal(QStringLiteral("uint:0"));

    makeWorkspace();
    settle();

    EXPECT_EQ(m_values, std::vector<bool> {});
    EXPECT_FALSE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
}

TEST_F(WorkspaceTest, otherSettingsAreIgnored)
{
    const auto portal = startPortal(QStringLiteral("uint:0"));
    makeWorkspace();
    settle();

    portal->tell(QStringLiteral("other org.freedesktop.appearance color-scheme"));
    portal->tell(QStringLiteral("other org.example.appearance contrast"));
    settle();

    EXPECT_EQ(m_values, std::vector<bool> {});
}

TEST_F(WorkspaceTest, variantThatIsWrappedOnceIsUnderstood)
{
    const auto portal = startPortal(QStringLiteral("plain:1"));

    makeWorkspace();

    EXPECT_TRUE(waitForValues({ true }));
}

TEST_F(WorkspaceTest, changeToAWrongTypeIsNormalContrast)
{
    const auto portal = startPortal(QStringLiteral("uint:1"));
    makeWorkspace();
    ASSERT_TRUE(waitForValues({ true }));

    portal->tell(QStringLiteral("change string:1"));

    EXPECT_TRUE(waitForValues({ true, false }));
}

/// An answer of Read() that does not ask for more contrast.
class WorkspaceAnswerTest : public WorkspaceTest, public testing::WithParamInterface<const char *>
{ };

TEST_P(WorkspaceAnswerTest, isNormalContrast)
{
    const auto portal = startPortal(QString::fromLatin1(GetParam()));

    makeWorkspace();
    settle();

    EXPECT_EQ(m_values, std::vector<bool> {});
    EXPECT_FALSE(m_workspace->accessibilityDisplayShouldIncreaseContrast());
}

INSTANTIATE_TEST_SUITE_P(Answers, WorkspaceAnswerTest,
    testing::Values("notfound", "string:1", "int:1", "uint:0", "uint:2"), [](const auto &answer) {
        std::string name = answer.param;
        std::erase(name, ':');
        return name;
    });

} // namespace penwick::platform
