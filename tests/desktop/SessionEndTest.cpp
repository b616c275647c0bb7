// SPDX-License-Identifier: MIT
// The end of a session, as the host and the desktop see it.
#include "desktop/support/BoardFixture.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

class SessionEnd : public BoardTest
{
protected:
    void expectGoodEnd()
    {
        EXPECT_EQ(host().waitForExit(), 0);
        const auto &posted = host().notifications();
        const auto isEnd = [](const PostedNotification &notification) {
            return notification.name.endsWith(QLatin1String(".penwick.session.end"));
        };
        EXPECT_EQ(std::count_if(posted.begin(), posted.end(), isEnd), 1);
        ASSERT_FALSE(posted.empty());
        EXPECT_TRUE(isEnd(posted.back()));
        EXPECT_EQ(posted.back().object, QJsonValue(false));
        EXPECT_FALSE(host().window(QStringLiteral("drawing")).isVisible);
        EXPECT_EQ(host().errorOutput(), QString());
        EXPECT_EQ(host().printedLines(), QStringList());
    }
};

} // namespace

TEST_F(SessionEnd, comesWithTheCloseOfAnEmptyBoard)
{
    open();

    desktop().windows().close(window());

    expectGoodEnd();
}

TEST_F(SessionEnd, comesWithTheCloseOfABoardThatWasDrawnOn)
{
    open();
    settle();

    desktop().windows().close(window());

    expectGoodEnd();
}

TEST_F(SessionEnd, comesWithTheWindowManagersKey)
{
    open();
    require([this] { return desktop().windows().active() == window(); }, "the board to be active");

    desktop().keyboard().pressWith("Alt_L", "F4");

    expectGoodEnd();
}

TEST_F(SessionEnd, comesWithTheToolThatEndsTheSession)
{
    open(HostProgram::Steered);

    host().selectTool(QStringLiteral("state"));

    expectGoodEnd();
}

} // namespace penwick::desktop
