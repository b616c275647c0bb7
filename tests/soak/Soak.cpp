// SPDX-License-Identifier: MIT
// penwick-soak: random sessions of any number and length, by seed.
#include "soak/Run.h"
#include "soak/SmallScreen.h"

#include <QApplication>
#include <QCommandLineParser>

#include <cstdio>

int main(int argc, char **argv)
{
    using penwick::test::freshSeed;
    using penwick::test::runSession;

    penwick::test::useSmallScreen();
    const QApplication application(argc, argv);

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral(
        "Random sessions on the assembled component, held against a second model step by step."));
    parser.addHelpOption();
    const QCommandLineOption seedOption(QStringLiteral("seed"),
        QStringLiteral("Seed of the first session; a fresh one by default."), QStringLiteral("S"));
    const QCommandLineOption stepsOption(QStringLiteral("steps"),
        QStringLiteral("Most steps of a session."), QStringLiteral("N"), QStringLiteral("1000"));
    const QCommandLineOption sessionsOption(QStringLiteral("sessions"),
        QStringLiteral("Number of sessions, each with the next seed."), QStringLiteral("M"),
        QStringLiteral("1"));
    parser.addOptions({ seedOption, stepsOption, sessionsOption });
    parser.process(application);

    for (const QCommandLineOption &option : { seedOption, stepsOption, sessionsOption }) {
        bool isNumber = false;
        static_cast<void>(parser.value(option).toULongLong(&isNumber));
        if (parser.isSet(option) && !isNumber) {
            std::fprintf(stderr, "penwick-soak: --%s wants a whole number\n",
                qPrintable(option.names().constFirst()));
            return 2;
        }
    }
    const qulonglong first
        = parser.isSet(seedOption) ? parser.value(seedOption).toULongLong() : freshSeed();
    const int steps = parser.value(stepsOption).toInt();
    const qulonglong sessions = parser.value(sessionsOption).toULongLong();
    std::printf("seed %llu, %llu session(s) of up to %d steps\n", first, sessions, steps);
    std::fflush(stdout);
    for (qulonglong seed = first; seed < first + sessions; ++seed) {
        if (const auto failure = runSession(seed, steps)) {
            std::printf("seed %llu differs from the second model\n%s", seed, failure->c_str());
            return 1;
        }
    }
    std::printf("every session went as the second model says\n");
    return 0;
}
