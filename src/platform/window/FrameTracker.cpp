// SPDX-License-Identifier: MIT
#include "platform/window/FrameTracker.h"

#include "platform/native/NativeDesktop.h"
#include "platform/window/ScreenCoordinates.h"

#include <QEvent>
#include <QGuiApplication>
#include <QPointer>
#include <QScreen>
#include <QWidget>

#include <algorithm>
#include <utility>

namespace penwick::platform {

namespace {

// After this a desktop that has not granted a request is not just slow.
constexpr Clock::Time goodWhile { 1000 };

} // namespace

FrameTracker::FrameTracker(QWidget &window)
    : QObject(&window)
    , m_window(window)
    , m_negotiation(window.geometry(), originInDesktop())
    , m_alarm(Clock::ofTheDesktop(), this)
    , m_doubt(Clock::ofTheDesktop(), this)
{
    connect(&m_alarm, &Alarm::rang, this, &FrameTracker::look);
    connect(&m_doubt, &Alarm::rang, this, &FrameTracker::doubt);
    m_window.installEventFilter(this);
    connect(
        qGuiApp, &QGuiApplication::primaryScreenChanged, this, &FrameTracker::followPrimaryScreen);
    followPrimaryScreen();
}

FrameTracker::~FrameTracker()
{
    NativeDesktop::instance().forget(m_followed);
}

Rect FrameTracker::frame() const
{
    return fromDesktop(m_negotiation.frame());
}

void FrameTracker::request(const Rect &frame)
{
    const QRectF wanted = toDesktopExactly(frame);
    if (!m_window.isVisible()) {
        m_negotiation.askUnseen(wanted);
        // The window has no borders yet, so its content is laid out as if it will have none.
        m_window.resize(rounded(wanted).size());
        return;
    }
    carryOut(m_negotiation.ask(wanted, Clock::ofTheDesktop().now()));
    lookSoon();
}

void FrameTracker::setOff(const Rect &target)
{
    carryOut(m_negotiation.setOff(toDesktopExactly(target), Clock::ofTheDesktop().now()));
}

void FrameTracker::step(const Rect &frame)
{
    place(m_negotiation.step(toDesktopExactly(frame)));
}

void FrameTracker::prepareToShow()
{
    // Otherwise the window would have another screen's scale until it is shown.
    if (QScreen *const screen = QGuiApplication::screenAt(rounded(m_negotiation.frame()).center()))
        m_window.setScreen(screen);
    m_window.winId(); // the desktop can only be asked about a window that exists
    QWindow &native = *m_window.windowHandle();
    QMargins margins;
    if (!m_window.windowFlags().testFlag(Qt::FramelessWindowHint)) {
        const auto told = NativeDesktop::instance().frameMarginsBeforeShow(native);
        margins = told ? *told / native.devicePixelRatio() : native.frameMargins();
    }
    const FrameEffects effects
        = m_negotiation.appear(margins, native.devicePixelRatio(), Clock::ofTheDesktop().now());
    followFrame();
    carryOut(effects);
    // The toolkit tells the window manager a corner only if it has changed. One that was not told
    // is the window manager's to choose.
    native.setPosition(m_window.geometry().topLeft());
    awaitNextLook();
}

// Frames are counted from the primary screen's corner, so another primary screen, or another size
// of it, changes them.
void FrameTracker::followPrimaryScreen()
{
    if (const QScreen *const primary = QGuiApplication::primaryScreen()) {
        connect(primary, &QScreen::geometryChanged, this, &FrameTracker::lookSoon,
            Qt::UniqueConnection);
    }
    lookSoon();
}

void FrameTracker::followFrame()
{
    QWindow &native = *m_window.windowHandle();
    const WId former = std::exchange(m_followed, native.winId());
    if (former != m_followed)
        NativeDesktop::instance().forget(former);
    connect(&native, &QWindow::screenChanged, this, &FrameTracker::lookSoon, Qt::UniqueConnection);
    NativeDesktop::instance().followFrame(native, [this](std::optional<QPoint> corner) {
        m_negotiation.hearCorner(corner, Clock::ofTheDesktop().now());
        lookSoon();
    });
}

bool FrameTracker::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::Show:
    case QEvent::WindowStateChange: // what the frame did while it was minimised was not looked at
        if (watched == &m_window)
            lookSoon();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

FrameObservation FrameTracker::observation() const
{
    const QWindow &native = *m_window.windowHandle();
    FrameObservation seen;
    seen.frame = native.frameGeometry();
    seen.content = native.geometry();
    seen.margins = native.frameMargins();
    seen.screen = native.screen()->geometry().topLeft();
    seen.origin = originInDesktop();
    seen.scale = native.devicePixelRatio();
    seen.isBorderless = m_window.windowFlags().testFlag(Qt::FramelessWindowHint);
    seen.isMinimised = m_window.isMinimized();
    seen.isArranged
        = m_window.windowState().testAnyFlags(Qt::WindowMaximized | Qt::WindowFullScreen);
    return seen;
}

// The toolkit tells of one change in several events; only after the last do all values agree.
void FrameTracker::lookSoon()
{
    if (m_window.isVisible())
        m_alarm.set(Clock::ofTheDesktop().now());
}

void FrameTracker::look()
{
    if (!m_window.isVisible())
        return;
    const QPointer<FrameTracker> self(this); // whoever is told may end the window
    carryOut(m_negotiation.look(observation(), Clock::ofTheDesktop().now()));
    if (self)
        awaitNextLook();
}

void FrameTracker::awaitNextLook()
{
    const auto next = m_negotiation.nextLook();
    if (next && (!m_alarm.at() || *next < *m_alarm.at()))
        m_alarm.set(*next);
}

void FrameTracker::carryOut(const FrameEffects &effects)
{
    const QPointer<FrameTracker> self(this);
    for (const auto &effect : effects) {
        if (!self)
            return;
        if (const auto *const placing = std::get_if<FramePlacing>(&effect))
            place(*placing);
        else
            tell(std::get<FrameNews>(effect));
    }
}

void FrameTracker::place(const FramePlacing &placing)
{
    Q_EMIT asking(placing.content);
    m_window.setGeometry(placing.content);
    m_doubt.set(Clock::ofTheDesktop().now() + goodWhile);
}

// The toolkit is told the truth in the only way that it can be: by asking for what is there.
void FrameTracker::doubt()
{
    if (!m_window.isVisible() || m_window.isMinimized())
        return;
    const QWindow &native = *m_window.windowHandle();
    const auto pixels = NativeDesktop::instance().contentOnScreen(*m_window.windowHandle());
    if (!pixels)
        return;
    const double scale = native.devicePixelRatio();
    const QRect content(fromPixels(pixels->topLeft(), native.screen()->geometry().topLeft(), scale),
        (QSizeF(pixels->size()) / scale).toSize());
    if (content == native.geometry())
        return;
    m_window.setGeometry(content);
    carryOut(m_negotiation.learn(observation(), Clock::ofTheDesktop().now()));
}

void FrameTracker::tell(const FrameNews &news)
{
    switch (news.kind) {
    case FrameNews::Kind::Rescaled:
        return Q_EMIT rescaled();
    case FrameNews::Kind::Confirmed:
        return Q_EMIT confirmed();
    case FrameNews::Kind::Resized:
        return Q_EMIT resized();
    case FrameNews::Kind::ResizedByUser:
        return Q_EMIT resizedByUser();
    case FrameNews::Kind::ResizedByDesktop:
        return Q_EMIT resizedByDesktop(fromDesktop(news.asked));
    case FrameNews::Kind::MoveBegan:
        return Q_EMIT moveBegan();
    case FrameNews::Kind::Shifted:
        return Q_EMIT shifted(news.delta);
    case FrameNews::Kind::Moved:
        return Q_EMIT moved();
    case FrameNews::Kind::Settled:
        if (m_negotiation.isAtRest()) // a listener may have asked for another frame meanwhile
            Q_EMIT settled();
        return;
    }
}

} // namespace penwick::platform
