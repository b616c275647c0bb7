// SPDX-License-Identifier: MIT
// penwick-leftovers [COUNT]: opens, uses and ends COUNT sessions, 100 by default, in one process,
// and says what they cost. Its status is 0 if none of them left anything behind, else 1.
#include "leftovers/Ledger.h"
#include "leftovers/Sessions.h"
#include "leftovers/TimedApplication.h"

#include <penwick/platform/NotificationCenter.h>

#include <QElapsedTimer>

#include <algorithm>
#include <cstdio>
#include <cstdlib>

using namespace penwick::test;
using penwick::WindowType;
using penwick::platform::NotificationCenter;

namespace {

// Prints what the toolkit says, but for one line: the offscreen platform says of every window that
// it cannot bring it to the front.
void passOn(QtMsgType, const QMessageLogContext &, const QString &message)
{
    if (message != QLatin1String("This plugin does not support raise()"))
        std::fprintf(stderr, "%s\n", message.toLocal8Bit().constData());
}

constexpr double microsecondsPerMillisecond = 1000.0;

double milliseconds(std::chrono::microseconds time)
{
    return static_cast<double>(time.count()) / microsecondsPerMillisecond;
}

void sayCosts(const Sessions &sessions)
{
    const char *const names[] = { "whiteboard", "annotation", "imageAnnotation" };
    for (const auto &[kind, cost] : sessions.costs()) {
        if (cost.openings.empty())
            continue;
        auto times = cost.openings;
        std::sort(times.begin(), times.end());
        std::printf("%-16s opened in %5.1f ms of the processor, at most %5.1f; "
                    "the host waited for it at most %5.1f ms\n",
            names[static_cast<int>(kind)], milliseconds(times[times.size() / 2]),
            milliseconds(times.back()), milliseconds(cost.longestCall));
    }
}

// An observer that a session had left behind would act on these notifications, and use objects that
// are gone. The last one carries no operation, which stops the process of any canvas that hears it.
void postWhatNoLiveCanvasTakes()
{
    const QString &end = penwick::penwickSessionEndNotificationKey();
    const QString prefix = end.chopped(QStringLiteral(".penwick.session.end").size());
    NotificationCenter &center = NotificationCenter::defaultCenter();
    center.postNotification(prefix + QStringLiteral(".penwik.notification"),
        QVariantMap { { QStringLiteral("enableUndo"), true } });
    center.postNotification(prefix + QStringLiteral(".penwick.notification.drawingview.update"));
    center.postNotification(prefix + QStringLiteral(".penwick.notification.drawsubview.update"),
        QStringLiteral("no operation"));
}

// Longer than the display takes for its last answers, than the tool bar's way back and than the
// banner: a timer that had outlived its session would fire into what is gone.
void rest()
{
    constexpr int time = 2000; // ms
    QElapsedTimer clock;
    clock.start();
    while (clock.elapsed() < time) {
        QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
}

// Ends with one session of each kind, so that what the toolkit keeps of the windows shown last,
// such as the pointer's shape, is the same each time.
bool comeToRest()
{
    constexpr int kinds = 3;
    Sessions last(kinds);
    if (!last.run())
        return false;
    rest();
    return true;
}

} // namespace

int main(int argumentCount, char **arguments)
{
    const int count = argumentCount > 1 ? std::atoi(arguments[1]) : 100;
    if (count <= 0 || argumentCount > 2) {
        std::fputs("Usage: penwick-leftovers [COUNT]\n", stderr);
        return 2;
    }
    countMemoryExactly(arguments);
    qInstallMessageHandler(passOn);
    TimedApplication application(argumentCount, arguments);
    QApplication::setQuitOnLastWindowClosed(false);

    // The first round fills what is filled only once in a process, and is not counted.
    if (Sessions warming(Sessions::wholeRound()); !warming.run() || !comeToRest())
        return EXIT_FAILURE;
    static_cast<void>(application.takeLongestBlock());
    Sessions sessions(count);
    const Ledger before = Ledger::taken();
    if (!sessions.run())
        return EXIT_FAILURE;
    const TimedApplication::Block block = application.takeLongestBlock();
    // At once, so that a timer that is still to fire is seen.
    const Ledger atOnce = Ledger::taken();
    if (!comeToRest())
        return EXIT_FAILURE;
    const Ledger after = Ledger::taken();

    sayRoutes(sessions.taken());
    sayCosts(sessions);
    std::printf(
        "longest event    %5.1f ms (%s)\n", milliseconds(block.time), block.what.constData());
    std::printf("memory kept      %5.1f bytes a session\n",
        (double(after.memory) - double(before.memory)) / count);
    QString left = leftBehind(before, after, count);
    if (atOnce.timers > before.timers)
        left += QStringLiteral("%1 timers still to fire\n").arg(atOnce.timers - before.timers);
    std::fputs(left.toLocal8Bit().constData(), stderr);
    std::fflush(stdout);
    postWhatNoLiveCanvasTakes();
    return left.isEmpty() ? EXIT_SUCCESS : EXIT_FAILURE;
}
