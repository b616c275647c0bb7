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

/// How often a thread of this process went to sleep because it had nothing to do, and so how often
/// one was to be woken.
class Sleeps
{
public:
    Sleeps()
    {
        m_connection = QObject::connect(QAbstractEventDispatcher::instance(),
            &QAbstractEventDispatcher::aboutToBlock, [this] { ++m_blocks; });
    }
    ~Sleeps() { QObject::disconnect(m_connection); }

    [[nodiscard]] long count() const
    {
#ifdef PENWICK_HAS_GETRUSAGE
        return ofAllThreads() - m_atFirst;
#else
        return m_blocks; // the event loop's own count, in which it may not have slept each time
#endif
    }

private:
#ifdef PENWICK_HAS_GETRUSAGE
    static long ofAllThreads()
    {
        rusage usage {};
        ::getrusage(RUSAGE_SELF, &usage);
        return usage.ru_nvcsw;
    }

    const long m_atFirst = ofAllThreads();
#endif
    QMetaObject::Connection m_connection;
    long m_blocks = 0;
};

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

    const Sleeps sleeps;
    const Stopwatch watch;
    runEventLoop(idleTime);
    const double cpu = watch.elapsed().cpu;
    const double slept = static_cast<double>(sleeps.count());

    // The end of the ten seconds is a wake-up too, and it is ours.
    return {
        { "7 wake-ups in 10 s of idling", "", std::max(slept - 1.0, 0.0), std::nullopt,
            { 0.0, std::nullopt } },
        { "7 processor time in 10 s of idling", "us", cpu, std::nullopt, {} },
    };
}

} // namespace penwick::bench
