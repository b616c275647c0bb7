// SPDX-License-Identifier: MIT
#include "leftovers/Sessions.h"

#include "leftovers/Ledger.h"

#include <penwick/platform/NotificationCenter.h>

#include <QAbstractButton>
#include <QApplication>
#include <QCloseEvent>
#include <QElapsedTimer>
#include <QKeyEvent>
#include <QTextEdit>
#include <QWindow>

#include <algorithm>
#include <cstdio>
#include <ctime>
#include <functional>

namespace penwick::test {

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

void choose(QObject &window, const char *tool)
{
    auto *const controller = window.findChild<QObject *>(QStringLiteral("drawViewController"));
    QMetaObject::invokeMethod(
        controller, "handleToolSelection", Q_ARG(QString, QLatin1String(tool)));
}

// A window of the session that is on the screen; null if there is none of that name.
QWidget *shownWindow(const char *name)
{
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        if (widget->objectName() == QLatin1String(name) && widget->isVisible())
            return widget;
    }
    return nullptr;
}

// The button of the tool bar with that identifier.
QWidget &toolButton(const char *name)
{
    for (QAbstractButton *const button :
        shownWindow("toolPanel")->findChildren<QAbstractButton *>()) {
        if (button->property("identifier").toString() == QLatin1String(name))
            return *button;
    }
    qFatal("the tool bar has no button %s", name);
}

// Writes `what` about session `number` to standard error. Always returns false.
bool complain(int number, const char *what)
{
    std::fprintf(stderr, "penwick-leftovers: session %d: %s\n", number, what);
    return false;
}

} // namespace

int Sessions::wholeRound()
{
    int kinds = 0;
    while (windowTypeFromRawValue(static_cast<std::uintptr_t>(kinds)))
        ++kinds;
    return kinds * static_cast<int>(allRoutes().size());
}

Sessions::Sessions(int count)
    : m_count(count)
    , m_taken(allRoutes().size())
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
    constexpr int kinds = 3;
    const WindowType kind = *windowTypeFromRawValue(static_cast<std::uintptr_t>(number % kinds));
    const std::size_t routeIndex = static_cast<std::size_t>(number / kinds) % allRoutes().size();
    const Route &route = allRoutes()[routeIndex];
    m_ends.clear();

    if (!openAndSee(kind))
        return complain(number, "the window did not come");
    use(number);
    if (!reach(route.moment))
        return complain(number, "the moment at which it should end did not come");
    end(route.end);

    if (!processUntil([] { return Ledger::widgetsThatAre().isEmpty(); })) {
        for (const QWidget *const widget : Ledger::widgetsThatAre())
            complain(number, widget->metaObject()->className());
        return complain(number, "these widgets stay");
    }
    m_hand.release(); // what it held is gone
    const std::vector<bool> wanted = route.end == End::HostDrops
        ? std::vector<bool> {}
        : std::vector<bool> { kind == WindowType::imageAnnotation };
    if (m_ends != wanted)
        return complain(number, "it ended otherwise than it should");
    ++m_taken[routeIndex];
    return true;
}

bool Sessions::openAndSee(WindowType kind)
{
    const microseconds before = processorTime();
    const auto start = Clock::now();
    open(kind);
    Cost &cost = m_costs[kind];
    cost.longestCall = std::max(
        cost.longestCall, std::chrono::duration_cast<microseconds>(Clock::now() - start));
    const auto isSeen = [this] {
        const QWindow *const native = window().windowHandle();
        return native && native->isExposed();
    };
    if (!processUntil(isSeen))
        return false;
    QCoreApplication::processEvents();
    cost.openings.push_back(processorTime() - before);
    return true;
}

platform::Window &Sessions::window() const
{
    return *m_penwick->penwickWindowController()->drawingWindow();
}

QWidget &Sessions::canvas() const
{
    return *window().findChild<QWidget *>(QStringLiteral("drawingView"));
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

// Draws a stroke, takes it back and draws it again, and makes a text box. Every second session also
// erases, and clears the canvas.
void Sessions::use(int number)
{
    m_hand.press(canvas(), { 150, 100 });
    m_hand.glide({ 100, 50 });
    m_hand.release();
    choose(window(), "undo");
    choose(window(), "redo");
    choose(window(), "text");
    m_hand.click(canvas(), { 300, 60 });
    QCoreApplication::processEvents();
    if (number % 2 == 0) {
        choose(window(), "eraser");
        m_hand.press(canvas(), { 200, 80 });
        m_hand.glide({ 0, 100 });
        m_hand.release();
        choose(window(), "clear");
    }
    QCoreApplication::processEvents();
}

bool Sessions::reach(Moment moment)
{
    switch (moment) {
    case Moment::Rest:
        return true;
    case Moment::Stroke:
        beginStroke();
        return true;
    case Moment::Edit:
        beginEdit();
        return true;
    case Moment::Popover:
        return openPopover();
    case Moment::Banner:
        return showBanner();
    case Moment::Settling:
        dropToolBarOutside();
        return true;
    case Moment::Glide: {
        dropToolBarOutside();
        const QWidget *const bar = shownWindow("toolPanel");
        return processUntil([bar, dropped = bar->pos()] { return bar->pos() != dropped; });
    }
    }
    return false;
}

void Sessions::beginStroke()
{
    choose(window(), "brush");
    m_hand.press(canvas(), { 400, 200 });
    m_hand.glide({ 60, 40 });
}

void Sessions::beginEdit()
{
    choose(window(), "text");
    m_hand.click(canvas(), { 320, 220 });
    const QList<QTextEdit *> boxes = window().findChildren<QTextEdit *>();
    QKeyEvent key(QEvent::KeyPress, Qt::Key_A, Qt::NoModifier, QStringLiteral("a"));
    QCoreApplication::sendEvent(boxes.last(), &key);
}

bool Sessions::openPopover()
{
    m_hand.click(toolButton("color"), { 10, 10 });
    return processUntil([] { return shownWindow("popover") != nullptr; });
}

bool Sessions::showBanner()
{
    m_penwick->showWindowSharingNotification();
    return processUntil([] { return shownWindow("banner") != nullptr; });
}

// Well outside, whatever the kind of the window.
void Sessions::dropToolBarOutside()
{
    constexpr double handle = 8.0; // below the upper edge
    QWidget &bar = *shownWindow("toolPanel");
    m_hand.press(bar, { bar.width() / 2.0, handle });
    m_hand.glide({ -(bar.x() + bar.width() * 2.0), 0.0 });
    QCoreApplication::processEvents();
    m_hand.release();
}

void Sessions::end(End how)
{
    switch (how) {
    case End::EndButton:
        m_hand.click(toolButton("state"), { 10, 10 });
        break;
    case End::TitleBar: {
        QCloseEvent event;
        QCoreApplication::sendEvent(window().windowHandle(), &event);
        break;
    }
    case End::HostCloses:
        window().close();
        break;
    case End::HostDrops:
        m_penwick.reset(); // nothing else holds it
        break;
    }
}

} // namespace penwick::test
