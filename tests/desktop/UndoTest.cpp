// SPDX-License-Identifier: MIT
// Undo and redo as they appear on the screen.
#include "desktop/support/BoardFixture.h"

#include <QJsonObject>

namespace penwick::desktop {

namespace {

class Undo : public BoardTest
{ };

} // namespace

TEST_F(Undo, takesTheNewestStrokeAndRedoBringsItBack)
{
    open(HostProgram::Steered);
    drag({ { 100, 100 }, { 300, 100 } });
    drag({ { 100, 200 }, { 300, 200 } });
    waitForLevel({ 298, 200 }, inkOnWhite);

    host().selectTool(QStringLiteral("undo"));
    waitForLevel({ 200, 200 }, 255);
    EXPECT_NEAR(level({ 200, 100 }), inkOnWhite, 1);

    host().selectTool(QStringLiteral("redo"));
    waitForLevel({ 200, 200 }, inkOnWhite);
}

TEST_F(Undo, everyStrokeEnablesUndoAndDisablesRedo)
{
    open();
    drag({ { 100, 100 }, { 300, 100 } });
    waitForLevel({ 298, 100 }, inkOnWhite);

    const std::vector<PostedNotification> &posted = host().notifications();
    ASSERT_EQ(posted.size(), 2U);
    EXPECT_TRUE(posted[0].name.endsWith(QLatin1String(".penwik.notification")));
    EXPECT_EQ(posted[0].object, (QJsonObject { { QStringLiteral("enableUndo"), true } }));
    EXPECT_TRUE(posted[1].name.endsWith(QLatin1String(".penwik.notification")));
    EXPECT_EQ(posted[1].object, (QJsonObject { { QStringLiteral("enableRedo"), false } }));
}

} // namespace penwick::desktop
