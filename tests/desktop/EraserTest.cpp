// SPDX-License-Identifier: MIT
// The eraser as it works on the screen.
#include "desktop/support/BoardFixture.h"

namespace penwick::desktop {

namespace {

class Eraser : public BoardTest
{ };

} // namespace

TEST_F(Eraser, clickOnACrossingRemovesTheOlderStroke)
{
    open(HostProgram::Steered);
    drag({ { 100, 150 }, { 300, 150 } });
    drag({ { 200, 50 }, { 200, 250 } });
    waitForLevel({ 200, 150 }, inkOnInk);

    host().selectTool(QStringLiteral("eraser"));
    click({ 200, 150 });

    waitForLevel({ 120, 150 }, 255);
    waitForLevel({ 200, 150 }, inkOnWhite);
    EXPECT_NEAR(level({ 200, 100 }), inkOnWhite, 1);
    EXPECT_EQ(level({ 280, 150 }), 255);
}

TEST_F(Eraser, dragAcrossThreeStrokesRemovesThemAll)
{
    open(HostProgram::Steered);
    for (const int x : { 150, 200, 250 })
        drag({ { x, 50 }, { x, 250 } });
    waitForLevel({ 250, 248 }, inkOnWhite);

    host().selectTool(QStringLiteral("eraser"));
    drag({ { 120, 150 }, { 280, 150 } });

    waitForLevel({ 250, 100 }, 255);
    EXPECT_EQ(darkest(picture()), 255);
}

TEST_F(Eraser, chosenAtStartDrawsNothing)
{
    open(HostProgram::AsShipped, { "--tool", "eraser" });

    drag({ { 100, 150 }, { 300, 150 } });
    desktop().windows().close(window());

    EXPECT_EQ(host().waitForExit(), 0);
    ASSERT_EQ(host().notifications().size(), 1U);
    EXPECT_TRUE(
        host().notifications().front().name.endsWith(QLatin1String(".penwick.session.end")));
}

} // namespace penwick::desktop
