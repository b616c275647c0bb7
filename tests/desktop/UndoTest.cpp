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

TEST_F(Undo, ofATextBoxLogsItsIdentifierAndARedrawWithoutObject)
{
    open(HostProgram::Steered);
    host().selectTool(QStringLiteral("text"));
    click({ 300, 200 });
    desktop().keyboard().type("a");
    click({ 600, 300 });
    const std::size_t before = host().notifications().size();

    host().selectTool(QStringLiteral("undo"));

    EXPECT_TRUE(waitUntil([&] { return host().notifications().size() == before + 5; }));
    const auto posted = host().notifications();
    std::vector<PostedNotification> undone(
        posted.begin() + static_cast<std::ptrdiff_t>(before), posted.end());
    ASSERT_EQ(undone.size(), 5U);
    EXPECT_TRUE(undone[0].name.endsWith(QLatin1String(".penwick.notification.drawsubview.update")));
    const QJsonObject order = undone[0].object.toObject();
    EXPECT_EQ(order.keys(), QStringList { QStringLiteral("removeWithId") });
    EXPECT_GT(order.value(QStringLiteral("removeWithId")).toInteger(), 0);
    EXPECT_TRUE(undone[1].name.endsWith(QLatin1String(".penwick.notification.drawingview.update")));
    EXPECT_TRUE(undone[1].object.isNull());
    EXPECT_EQ(undone[2].object, (QJsonObject { { QStringLiteral("enableRedo"), true } }));
    EXPECT_EQ(undone[3].object, (QJsonObject { { QStringLiteral("enableUndo"), false } }));
    EXPECT_TRUE(undone[4].name.endsWith(QLatin1String(".penwick.notification.drawingview.update")));
}

} // namespace penwick::desktop
