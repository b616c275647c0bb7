// SPDX-License-Identifier: MIT
// Whether anything runs while nothing happens on a board.
#include "Board.h"
#include "Figure.h"

#include <QAbstractEventDispatcher>
#include <QEventLoop>
#include <QTimer>

#include <algorithm>

#ifdef PENWICK_HAS_GETRUSAGE
#include <sys/resource.h>
#endif

namespace penwick::bench {

namespace {

using namespace std::chrono_literals;

constexpr auto idleTime = 10s;
constexpr auto settlingTime = 1s; // for whatever goes on when a window has opened

/// How often a thread of this process has gone to sleep because it had nothing to do.
long sleeps()
{
#ifdef PENWICK_HAS_GETRUSAGE
    rusage usage {};
    ::getrusage(RUSAGE_SELF, &usage);
    return usage.ru_nvcsw;
#else
    return 0;
#endif
}

void runEventLoop(std::chrono::milliseconds time)
{
    QEventLoop loop;
    QTimer::singleShot(time, Qt::PreciseTimer, &loop, &QEventLoop::quit);
    loop.exec();
}

} // namespace

Figures idleFigures()
{
    Board board(0);
    Pen pen(17);
    board.draw(pen);
    runEventLoop(settlingTime);

    long blocks = 0;
    const auto connection = QObject::connect(QAbstractEventDispatcher::instance(),
        &QAbstractEventDispatcher::aboutToBlock, [&blocks] { ++blocks; });
    const long sleepsBefore = sleeps();
    const Stopwatch watch;
    runEventLoop(idleTime);
    const double cpu = watch.elapsed().cpu;
    const long slept = sleeps() - sleepsBefore;
    QObject::disconnect(connection);

    // The end of the ten seconds is a wake-up too, and it is ours.
    const double wakeUps = static_cast<double>(std::max({ blocks - 1, slept - 1, 0L }));
    return {
        { "7 wake-ups in 10 s of idling", "", wakeUps, std::nullopt, { 0.0, std::nullopt } },
        { "7 processor time in 10 s of idling", "us", cpu, std::nullopt, {} },
    };
}

} // namespace penwick::bench
