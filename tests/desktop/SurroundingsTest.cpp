// SPDX-License-Identifier: MIT
// A process whose surroundings are poor: no bus, another locale, no home, no more X server.
#include "desktop/support/FaultFixture.h"

#include <QDir>
#include <QFile>
#include <QProcess>

namespace penwick::desktop {

namespace {

class Surroundings : public FaultTest
{ };

/// Makes a configuration of fonts that knows one alone; gives the file.
std::string onlyOneFont(const Desktop &desktop)
{
    QProcess match;
    match.start(QStringLiteral("fc-match"),
        { QStringLiteral("-f"), QStringLiteral("%{file}"), QStringLiteral("DejaVu Sans") });
    match.waitForFinished();
    const QString font = QString::fromLocal8Bit(match.readAllStandardOutput());
    const QDir folder(QString::fromStdString(desktop.file("fonts")));
    EXPECT_TRUE(folder.mkpath(QStringLiteral("."))
        && QFile::copy(font, folder.filePath(QStringLiteral("only.ttf"))))
        << font.toStdString();
    QFile configuration(folder.filePath(QStringLiteral("fonts.conf")));
    EXPECT_TRUE(configuration.open(QFile::WriteOnly));
    configuration.write("<fontconfig><dir>" + folder.path().toLocal8Bit() + "</dir><cachedir>"
        + folder.path().toLocal8Bit() + "</cachedir></fontconfig>");
    return configuration.fileName().toStdString();
}

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

TEST_F(Surroundings, withOneFontAloneAreWrittenInWithThat)
{
    startKind("whiteboard", { "--tool", "text" }, { "FONTCONFIG_FILE=" + onlyOneFont(desktop()) });
    click({ 300, 200 });

    desktop().keyboard().type("mmm");

    const QRect line(onScreen({ 306, 200 }), QSize(50, 20)); // inside the box's border
    constexpr int inkLevel = 60; // the placeholder is lighter
    EXPECT_TRUE(waitUntil([&] { return darkest(desktop().screen().picture(line)) < inkLevel; }));
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
