// SPDX-License-Identifier: MIT
// A process whose surroundings are poor: no bus, another locale, no home, no more X server.
#include "desktop/support/FaultFixture.h"

#include <QDir>
#include <QFile>
#include <QProcess>

#include <algorithm>

namespace penwick::desktop {

namespace {

class Surroundings : public FaultTest
{ };

/// Makes a configuration of fonts that knows `family` alone; gives the file.
std::string onlyOneFont(const Desktop &desktop, const QString &family)
{
    QProcess match;
    match.start(
        QStringLiteral("fc-match"), { QStringLiteral("-f"), QStringLiteral("%{file}"), family });
    match.waitForFinished();
    const QString font = QString::fromLocal8Bit(match.readAllStandardOutput());
    const QDir folder(QString::fromStdString(desktop.file(family.toStdString())));
    EXPECT_TRUE(folder.mkpath(QStringLiteral("."))
        && QFile::copy(font, folder.filePath(QStringLiteral("only.ttf"))))
        << font.toStdString();
    QFile configuration(folder.filePath(QStringLiteral("fonts.conf")));
    EXPECT_TRUE(configuration.open(QFile::WriteOnly));
    configuration.write("<fontconfig><dir>" + folder.path().toLocal8Bit() + "</dir><cachedir>"
        + folder.path().toLocal8Bit() + "</cachedir></fontconfig>");
    return configuration.fileName().toStdString();
}

int widthOfInk(const QImage &image)
{
    constexpr int inkLevel = 60; // the placeholder is lighter
    int first = image.width();
    int last = -1;
    for (int x = 0; x < image.width(); ++x) {
        for (int y = 0; y < image.height(); ++y) {
            if (qGray(image.pixel(x, y)) < inkLevel) {
                first = std::min(first, x);
                last = x;
            }
        }
    }
    return std::max(0, last - first + 1);
}

class LostConnection : public FaultOfEachKind
{ };

} // namespace

TEST_F(Surroundings, busAddressOfNoSenseChangesNothing)
{
    startKind("whiteboard", {}, { "DBUS_SESSION_BUS_ADDRESS=nonsense" });

    expectInk();

    expectNothingSaid();
    expectEndByTool();
}

TEST_F(Surroundings, busThatGoesAwayChangesNothing)
{
    startKind("whiteboard", {}, { "DBUS_SESSION_BUS_ADDRESS=" + desktop().sessionBus() });
    expectInk();

    desktop().endSessionBus();

    expectInk();
    expectNothingSaid();
    expectEndByTool();
}

TEST_F(Surroundings, decimalCommaIsReadInAThickness)
{
    startKind("whiteboard", { "--option", "brush#7,5" }, { "LC_NUMERIC=de_DE.UTF-8" });

    drag({ { 200, 100 }, { 300, 100 } });

    // The line lies between two rows of pixels. On each side of it three rows are wholly covered,
    // and three quarters of a fourth: eight rows in all.
    waitForLevel({ 250, 100 }, inkOnWhite);
    int rows = 0;
    for (int y = 90; y < 110; ++y)
        rows += level({ 250, y }) < 255 ? 1 : 0;
    EXPECT_EQ(rows, 8);
}

TEST_F(Surroundings, homeThatCannotBeWrittenToChangesNothing)
{
    startKind("whiteboard", {}, { "HOME=/dev/null/home" });

    expectInk();

    expectNothingSaid();
    expectEndByTool();
}

TEST_F(Surroundings, textIsWrittenInTheOnlyFontThereIs)
{
    // "mim" is about 50 pixels wide in the one and 41 in the other.
    std::vector<int> widths;
    for (const char *const family : { "DejaVu Sans", "DejaVu Sans Mono" }) {
        startKind("whiteboard", { "--tool", "text" },
            { "FONTCONFIG_FILE=" + onlyOneFont(desktop(), QString::fromLatin1(family)) });
        click({ 300, 200 });

        desktop().keyboard().type("mim");

        const QRect line(onScreen({ 306, 200 }), QSize(80, 20)); // inside the box's border
        int width = 0;
        EXPECT_TRUE(waitUntil([&] {
            width = widthOfInk(desktop().screen().picture(line));
            return width >= 38;
        })) << width;
        widths.push_back(width);
        expectNothingSaid();
        expectEndByTool();
    }
    EXPECT_GT(widths.at(0), widths.at(1) + 5); // more than a caret
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
