// SPDX-License-Identifier: MIT
#include "leftovers/Sessions.h"

#include "leftovers/Ledger.h"

#include <penwick/platform/NotificationCenter.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QMouseEvent>
#include <QWindow>

#include <algorithm>
#include <cstdio>
#include <ctime>
#include <functional>

namespace penwick::leftovers {

namespace {

using platform::NotificationCenter;
using std::chrono::microseconds;
using Clock = std::chrono::steady_clock;

constexpr int generousBound = 10'000; // ms

microseconds processorTime()
{
    timespec time {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
    return std::chrono::duration_cast<microseconds>(
        std::chrono::seconds(time.tv_sec) + std::chrono::nanoseconds(time.tv_nsec));
}

bool processUntil(const std::function<bool()> &condition)
{
    QElapsedTimer clock;
    clock.start();
    while (!condition()) {
        if (clock.elapsed() > generousBound)
            return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    return true;
}

void sendPointer(QWidget &canvas, QEvent::Type type, QPointF place)
{
    const bool isMove = type == QEvent::MouseMove;
    QMouseEvent event(type, place, canvas.mapToGlobal(place),
        isMove ? Qt::NoButton : Qt::LeftButton,
        type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&canvas, &event);
}

void drag(QWidget &canvas, QPointF from, QPointF way)
{
    constexpr int steps = 10;
    sendPointer(canvas, QEvent::MouseButtonPress, from);
    for (int step = 1; step <= steps; ++step)
        sendPointer(canvas, QEvent::MouseMove, from + way * step / steps);
    sendPointer(canvas, QEvent::MouseButtonRelease, from + way);
}

void choose(QObject &window, const char *tool)
{
    auto *const controller = window.findChild<QObject *>(QStringLiteral("drawViewController"));
    QMetaObject::invokeMethod(
        controller, "handleToolSelection", Q_ARG(QString, QLatin1String(tool)));
}

// Always false.
bool complain(int number, const char *what)
{
    std::fprintf(stderr, "penwick-sessions: session %d: %s\n", number, what);
    return false;
}

} // namespace

Sessions::Sessions(int count)
    : m_count(count)
{
    for (std::uintptr_t kind = 0; windowTypeFromRawValue(kind); ++kind)
        m_costs[*windowTypeFromRawValue(kind)].openings.reserve(static_cast<std::size_t>(count));
    m_ends.reserve(1);
    NotificationCenter::defaultCenter().addObserver(
        this, penwickSessionEndNotificationKey(), [this](const platform::Notification &end) {
            m_ends.push_back(end.object.toBool());
            m_penwick.reset(); // here, inside the news
        });
}

Sessions::~Sessions()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

bool Sessions::run()
{
    for (int number = 0; number < m_count; ++number) {
        if (!runOne(number))
            return false;
    }
    return true;
}

bool Sessions::runOne(int number)
{
    const WindowType kind = *windowTypeFromRawValue(static_cast<std::uintptr_t>(number % 3));
    const End how = static_cast<End>(number / 3 % 3);
    m_ends.clear();

    const microseconds before = processorTime();
    const auto start = Clock::now();
    open(kind);
    Cost &cost = m_costs[kind];
    cost.longestCall = std::max(
        cost.longestCall, std::chrono::duration_cast<microseconds>(Clock::now() - start));
    const auto isSeen = [this] {
        const QWindow *const window
            = m_penwick->penwickWindowController()->drawingWindow()->windowHandle();
        return window && window->isExposed();
    };
    if (!processUntil(isSeen))
        return complain(number, "the window did not come");
    QCoreApplication::processEvents();
    cost.openings.push_back(processorTime() - before);

    use(number);
    end(how);

    if (!processUntil([] { return Ledger::widgetsThatAre().isEmpty(); })) {
        for (const QWidget *const widget : Ledger::widgetsThatAre())
            complain(number, widget->metaObject()->className());
        return complain(number, "these widgets stay");
    }
    const std::vector<bool> wanted = how == End::ByLettingGo
        ? std::vector<bool> {}
        : std::vector<bool> { kind == WindowType::imageAnnotation };
    if (m_ends != wanted)
        return complain(number, "it ended otherwise than it should");
    return true;
}

void Sessions::open(WindowType kind)
{
    std::optional<QImage> image;
    std::optional<QString> title;
    if (kind == WindowType::imageAnnotation) {
        image = QImage(640, 360, QImage::Format_RGB32);
        image->fill(Qt::white);
        title = QStringLiteral("A captured frame");
    }
    m_penwick = std::make_unique<Penwick>();
    m_penwick->createDrawingWindowController(kind, QGuiApplication::primaryScreen(), image, title)
        ->showWindow(nullptr);
}

// A stroke, a text box, every button's state, and a banner that is still up at the end.
void Sessions::use(int number)
{
    platform::Window &window = *m_penwick->penwickWindowController()->drawingWindow();
    auto &canvas = *window.findChild<QWidget *>(QStringLiteral("drawingView"));
    m_penwick->showWindowSharingNotification();
    drag(canvas, { 150, 100 }, { 100, 50 });
    choose(window, "undo");
    choose(window, "redo");
    choose(window, "text");
    drag(canvas, { 300, 60 }, { 0, 0 });
    QCoreApplication::processEvents();
    if (number % 2 == 0) {
        choose(window, "eraser");
        drag(canvas, { 200, 80 }, { 0, 100 });
        choose(window, "clear");
    }
    QCoreApplication::processEvents();
}

void Sessions::end(End how)
{
    // Nothing but m_penwick holds it.
    platform::Window *const window = m_penwick->penwickWindowController()->drawingWindow();
    switch (how) {
    case End::ByTheHost:
        window->close();
        break;
    case End::ByTheTool:
        choose(*window, "state");
        break;
    case End::ByLettingGo:
        m_penwick.reset();
        break;
    }
}

} // namespace penwick::leftovers
