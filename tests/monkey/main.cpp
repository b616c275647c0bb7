// SPDX-License-Identifier: MIT
// penwick-monkey: random pointer and key events on one window of a sanitized host, on a private
// desktop. It ends well if the host is alive and answers at the end, and every session ended well.
#include "monkey/Monkey.h"
#include "monkey/MonkeyHost.h"

#include <QCommandLineParser>
#include <QCoreApplication>

#include <cstdio>
#include <exception>
#include <random>

namespace {

using penwick::desktop::Desktop;
using penwick::desktop::Monkey;
using penwick::desktop::MonkeyHost;

constexpr int betweenQuestions = 100; // events: the host is not to fall far behind

void play(Monkey &monkey, MonkeyHost &host, int events)
{
    int sinceQuestion = 0;
    for (int done = 0; done < events;) {
        const int count = monkey.act();
        done += count;
        sinceQuestion += count;
        host.keepOpen();
        if (sinceQuestion < betweenQuestions)
            continue;
        host.awaitAnswer();
        sinceQuestion = 0;
    }
    monkey.letGo();
    host.awaitAnswer();
    host.end();
}

// Returns the program's status.
int playAndTell(Monkey &monkey, MonkeyHost &host, int events)
{
    try {
        play(monkey, host, events);
    } catch (const std::exception &problem) {
        std::printf("%s, after:\n", problem.what());
        for (const std::string &act : monkey.memory())
            std::printf("  %s\n", act.c_str());
        std::printf("its errors:\n%s\n", host.errorOutput().c_str());
        return 1;
    }
    std::printf("the host is well after %d session(s)\n", host.sessions());
    return 0;
}

} // namespace

int main(int argc, char **argv)
{
    const QCoreApplication application(argc, argv);
    QCommandLineParser parser;
    parser.setApplicationDescription(
        QStringLiteral("Random pointer and key events on one window of a sanitized host."));
    parser.addHelpOption();
    parser.addOptions({
        { QStringLiteral("seed"), QStringLiteral("A fresh one by default."), QStringLiteral("S") },
        { QStringLiteral("events"), QStringLiteral("How many."), QStringLiteral("N"),
            QStringLiteral("3000") },
        { QStringLiteral("window"), QStringLiteral("whiteboard, annotation or imageAnnotation."),
            QStringLiteral("KIND"), QStringLiteral("whiteboard") },
        { QStringLiteral("host"), QStringLiteral("The host program, which takes orders."),
            QStringLiteral("FILE"), QStringLiteral(PENWICK_MONKEY_HOST) },
    });
    parser.process(application);
    for (const QString &option : { QStringLiteral("seed"), QStringLiteral("events") }) {
        bool isNumber = false;
        static_cast<void>(parser.value(option).toULongLong(&isNumber));
        if (parser.isSet(option) && !isNumber) {
            std::fprintf(stderr, "penwick-monkey: --%s wants a whole number\n", qPrintable(option));
            return 2;
        }
    }
    const qulonglong seed = parser.isSet(QStringLiteral("seed"))
        ? parser.value(QStringLiteral("seed")).toULongLong()
        : std::random_device()();
    const int events = parser.value(QStringLiteral("events")).toInt();
    const std::string kind = parser.value(QStringLiteral("window")).toStdString();
    std::printf("penwick-monkey --seed %llu --events %d --window %s\n", seed, events, kind.c_str());
    std::fflush(stdout);

    try {
        Desktop desktop;
        MonkeyHost host(desktop, parser.value(QStringLiteral("host")).toStdString(), kind);
        Monkey monkey(desktop, host, seed);
        return playAndTell(monkey, host, events);
    } catch (const std::exception &problem) {
        // There is no desktop, or no host on it.
        std::fprintf(stderr, "error: %s\n", problem.what());
        return 1;
    }
}
