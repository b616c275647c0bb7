// SPDX-License-Identifier: MIT
// A process whose surroundings are poor: no bus, another locale, no home, no more X server.
#include "desktop/support/FaultFixture.h"

namespace penwick::desktop {

namespace {

class Surroundings : public FaultTest
{ };

class LostConnection : public FaultOfEachKind
{ };

} // namespace

TEST_F(Surroundings, withABusAddressOfNoSenseAreNothingToSpeakOf)
{
    startKind("whiteboard", {}, { "DBUS_SESSION_BUS_ADDRESS=nonsense" });

    expectInk();

    expectNothingSaid();
    expectEndByTool();
}

TEST_F(Surroundings, whoseBusGoesAwayMeanwhileAreNothingToSpeakOf)
{
    startKind("whiteboard", {}, { "DBUS_SESSION_BUS_ADDRESS=" + desktop().sessionBus() });
    expectInk();

    desktop().endSessionBus();

    expectInk();
    expectNothingSaid();
    expectEndByTool();
}

TEST_F(Surroundings, withADecimalCommaTakeSevenAndAHalfAsThicknessWithOne)
{
    startKind("whiteboard", { "--option", "brush#7,5" }, { "LC_NUMERIC=de_DE.UTF-8" });

    drag({ { 200, 100 }, { 300, 100 } });

    // Ten rows around the line: seven whole ones, and a part of one on either side.
    waitForLevel({ 250, 100 }, inkOnWhite);
    int rows = 0;
    for (int y = 90; y < 110; ++y)
        rows += level({ 250, y }) < 255 ? 1 : 0;
    EXPECT_EQ(rows, 8);
}

TEST_F(Surroundings, withoutAHomeThatCanBeWrittenAreNothingToSpeakOf)
{
    startKind("whiteboard", {}, { "HOME=/dev/null/home" });

    expectInk();

    expectNothingSaid();
    expectEndByTool();
}

TEST_P(LostConnection, endsTheProgramWithoutAWordOfOurs)
{
    startKind(GetParam());
    expectInk();

    desktop().windows().cutOff(window());

    EXPECT_EQ(host().waitForExit(), 1); // the toolkit's own way
    EXPECT_FALSE(host().errorOutput().contains(QLatin1String("penwick: fatal")));
    EXPECT_EQ(host().printedLines(), QStringList());
}

INSTANTIATE_TEST_SUITE_P(Kinds, LostConnection, testing::ValuesIn(allKinds()), kindName);

} // namespace penwick::desktop
