// SPDX-License-Identifier: MIT
#include "platform/FrameTracker.h"

#include "platform/ScreenCoordinates.h"
#include "platform/native/NativeDesktop.h"

#include <QEvent>
#include <QGuiApplication>
#include <QScreen>
#include <QWidget>
#include <QWindow>

#include <utility>

namespace penwick::platform {

namespace {

// How often, and after what time each, a request that was not granted is looked at again before
// what stands there is taken for the answer. The desktop does not announce every step of its own.
constexpr int looks = 6;
constexpr int lookInterval = 50; // ms
constexpr int looksBeforeAskingAgain = 3; // of those that are left

// Steps of one move by the user follow each other faster than this.
constexpr int longestRest = 500; // ms

// How long after it was shown, or framed anew, a window is still being put in its place.
constexpr int newness = 2000; // ms

} // namespace

FrameTracker::FrameTracker(QWidget &window)
    : QObject(&window)
    , m_window(window)
    , m_frame(window.geometry())
    , m_origin(originInDesktop())
{
    m_check.setSingleShot(true);
    m_check.setInterval(0);
    connect(&m_check, &QTimer::timeout, this, &FrameTracker::check);
    m_patience.setInterval(lookInterval);
    connect(&m_patience, &QTimer::timeout, this, &FrameTracker::lookAgain);
    m_userMove.setSingleShot(true);
    m_userMove.setInterval(longestRest);
    connect(&m_userMove, &QTimer::timeout, this, &FrameTracker::check);
    m_window.installEventFilter(this);
    connect(
        qGuiApp, &QGuiApplication::primaryScreenChanged, this, &FrameTracker::followPrimaryScreen);
    followPrimaryScreen();
}

FrameTracker::~FrameTracker()
{
    NativeDesktop::instance().forgetFrame(m_followed);
}

Rect FrameTracker::frame() const
{
    return fromDesktop(m_frame);
}

void FrameTracker::request(const Rect &frame)
{
    m_frame = toDesktopExactly(frame);
    m_askedBeforeFrame.reset();
    if (!m_window.isVisible()) {
        // Nobody has decorated it yet, so its content may be laid out as if nobody will.
        m_window.resize(rounded(m_frame).size());
        return;
    }
    applyRequest();
    awaitAnswer();
    m_check.start();
}

void FrameTracker::prepareToShow()
{
    // Or it would measure in another screen's points until it is there.
    if (QScreen *const screen = QGuiApplication::screenAt(rounded(m_frame).center()))
        m_window.setScreen(screen);
    m_window.winId(); // the desktop can only be asked about a window that exists
    QWindow &native = *m_window.windowHandle();
    if (m_window.windowFlags().testFlag(Qt::FramelessWindowHint)) {
        m_margins = QMargins();
    } else if (const auto margins = NativeDesktop::instance().frameMarginsBeforeShow(native)) {
        m_margins = *margins / native.devicePixelRatio();
    } else {
        m_margins = native.frameMargins();
    }
    followFrame();
    m_scale = native.devicePixelRatio();
    m_sinceFramed.start();
    applyRequest();
    m_announced = rounded(m_frame);
    awaitAnswer();
}

// What a frame is measured from moves with it.
void FrameTracker::followPrimaryScreen()
{
    if (const QScreen *const primary = QGuiApplication::primaryScreen()) {
        connect(primary, &QScreen::geometryChanged, &m_check, qOverload<>(&QTimer::start),
            Qt::UniqueConnection);
    }
    if (m_window.isVisible())
        m_check.start();
}

void FrameTracker::followFrame()
{
    QWindow &native = *m_window.windowHandle();
    const WId former = std::exchange(m_followed, native.winId());
    if (former != m_followed)
        NativeDesktop::instance().forgetFrame(former);
    m_corner.reset();
    m_isFrameLost = false;
    m_askedBeforeFrame.reset();
    connect(&native, &QWindow::screenChanged, &m_check, qOverload<>(&QTimer::start),
        Qt::UniqueConnection);
    NativeDesktop::instance().followFrame(native, [this](std::optional<QPoint> corner) {
        if (corner.has_value() != m_corner.has_value())
            onFrameExchanged(corner.has_value());
        m_corner = corner;
        m_check.start();
    });
}

// The window manager that ends takes its frames along, and the one that comes back builds them
// elsewhere before it puts them in their place. Neither is a move by the user, unless the window
// comes to rest elsewhere.
void FrameTracker::onFrameExchanged(bool hasFrame)
{
    if (!m_window.isVisible())
        return;
    m_isFrameLost = !hasFrame;
    // The window manager was slow, and the toolkit believes in a place inside a frame in the
    // making.
    if (hasFrame && m_askedBeforeFrame)
        m_frame = *m_askedBeforeFrame;
    m_askedBeforeFrame.reset();
    m_sinceFramed.start();
    awaitAnswer();
}

void FrameTracker::applyRequest()
{
    Q_EMIT asking();
    m_window.setGeometry(rounded(m_frame).marginsRemoved(m_margins));
}

bool FrameTracker::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::Show:
    case QEvent::WindowStateChange: // what the frame did while it was minimised was not looked at
        // The events come one by one, and the frame is whole only after the last of them.
        if (watched == &m_window && m_window.isVisible())
            m_check.start();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

QRect FrameTracker::outerGeometry() const
{
    const QWindow &native = *m_window.windowHandle();
    QRect outer = native.frameGeometry();
    if (m_window.windowFlags().testFlag(Qt::FramelessWindowHint))
        outer = native.geometry();
    else if (m_isFrameLost) // the next window manager puts it around the content that is there
        outer = native.geometry().marginsAdded(m_margins);
    if (m_corner) {
        // The toolkit keeps a screen's corner in device pixels and scales what lies inside it.
        const QPoint screen = native.screen()->geometry().topLeft();
        outer.moveTopLeft(
            screen + (QPointF(*m_corner - screen) / native.devicePixelRatio()).toPoint());
    }
    return outer;
}

void FrameTracker::check()
{
    if (!m_window.isVisible())
        return;
    if (m_window.isMinimized()) {
        m_patience.stop(); // nobody answers meanwhile
        return;
    }
    if (m_isPending && !m_patience.isActive())
        awaitAnswer();
    adoptScale();
    if (isDecoratedAnew()) {
        m_margins = m_window.windowHandle()->frameMargins();
        applyRequest();
        awaitAnswer();
        return;
    }
    const QRect outer = outerGeometry();
    if (!isWhereItBelongs(outer)) {
        // Until the desktop answers or patience ends; and after an answer too, because where
        // requests go back and forth it may be the answer to an older one, and those in between
        // come later.
        if (m_isPending || m_patience.isActive())
            return;
        if (!m_corner && !m_askedBeforeFrame && isNew())
            m_askedBeforeFrame = m_frame;
        m_frame = outer;
        m_isByUser = true;
    }
    const bool wasPending = std::exchange(m_isPending, false);
    mendToolkit();
    if (wasPending)
        Q_EMIT confirmed();
    announce();
    if (!m_isPending)
        Q_EMIT settled();
}

// On a screen of another scale the same window and the same title bar measure other points. What
// the program has asked for in points still holds.
void FrameTracker::adoptScale()
{
    const QWindow &native = *m_window.windowHandle();
    const double scale = native.devicePixelRatio();
    const double before = std::exchange(m_scale, scale);
    if (before == scale)
        return;
    if (m_isFrameLost || isArranged())
        m_margins = m_margins * (before / scale);
    else if (!m_window.windowFlags().testFlag(Qt::FramelessWindowHint))
        m_margins = native.frameMargins();
    // A toolkit that answers before the desktop has done so may grant what is not there yet.
    // Without more patience: what is asked for may itself bring the window to the screen and back.
    m_isPending |= m_patience.isActive();
    if (m_isPending)
        applyRequest();
    else
        m_isRescaled = true;
    Q_EMIT rescaled();
}

bool FrameTracker::isNew() const
{
    return m_sinceFramed.isValid() && m_sinceFramed.elapsed() < newness;
}

// Borders of a pixel cannot be told in points where a point is more than that.
bool FrameTracker::isWhereItBelongs(const QRect &outer) const
{
    const QRect frame = rounded(m_frame);
    if (m_scale == 1.0)
        return outer == frame;
    const QMargins point(1, 1, 1, 1);
    return frame.marginsAdded(point).contains(outer) && outer.marginsAdded(point).contains(frame);
}

// A window manager may move a frame without a word to its window right after it has decorated it;
// the toolkit then holds a place that was true for a moment. It is told the true one as soon as the
// window moves again; asking for where it stands anyway would move nothing. Later on, and while the
// user drags the window, the toolkit may well lag behind.
void FrameTracker::mendToolkit()
{
    QRect believed = rounded(m_frame);
    believed.moveTopLeft(m_window.windowHandle()->frameGeometry().topLeft());
    const bool isStale = m_corner && isNew() && !m_isByUser && !m_userMove.isActive()
        && !isArranged() && !isWhereItBelongs(believed);
    if (isStale && !std::exchange(m_isMended, true)) {
        m_window.setGeometry(rounded(m_frame).marginsRemoved(m_margins).translated(1, 0));
        applyRequest();
        awaitAnswer();
    } else if (!isStale) {
        m_isMended = false;
    }
}

// Another title bar is the desktop's doing and not the user's, so the frame that was asked for
// still holds. A window that was just shown has no margins at all until it is decorated.
bool FrameTracker::isDecoratedAnew() const
{
    if (m_window.windowFlags().testFlag(Qt::FramelessWindowHint) || m_isFrameLost)
        return false; // whatever the toolkit makes of a frame that is still being built
    const QMargins margins = m_window.windowHandle()->frameMargins();
    return margins != m_margins && !(m_isPending && margins.isNull()) && !isArranged();
}

// Where the desktop says what size the window has, and often without borders.
bool FrameTracker::isArranged() const
{
    return m_window.windowState().testAnyFlags(Qt::WindowMaximized | Qt::WindowFullScreen);
}

void FrameTracker::announceUserMove()
{
    const bool goesOn = m_userMove.isActive();
    m_userMove.start();
    if (!goesOn)
        Q_EMIT moveBegan();
}

void FrameTracker::awaitAnswer()
{
    m_isPending = true;
    m_looksLeft = looks;
    m_patience.start();
}

void FrameTracker::lookAgain()
{
    if (--m_looksLeft <= 0) {
        m_patience.stop();
        if (std::exchange(m_isPending, false))
            m_givenUp = m_frame;
    } else if (m_looksLeft == looksBeforeAskingAgain && isOverlooked()) {
        applyRequest();
    }
    check();
    m_givenUp.reset();
}

// A window manager that is busy with a new window may answer an older request, or hold this one
// against the limits of an older one. One that refuses does so twice.
bool FrameTracker::isOverlooked() const
{
    return m_isPending && m_window.isVisible() && !m_isFrameLost && !isArranged()
        && !isWhereItBelongs(outerGeometry());
}

// As many pixels are other points. A move comes before the size here, so that whatever keeps its
// distance from the window's corner does so in points.
void FrameTracker::announceRescaled(QPoint delta, bool hasResized)
{
    if (!delta.isNull()) {
        announceUserMove();
        Q_EMIT shifted(delta);
        Q_EMIT moved();
    }
    if (hasResized)
        Q_EMIT resized();
}

void FrameTracker::announce()
{
    const QRect outer = rounded(m_frame);
    const bool hasResized = outer.size() != m_announced.size();
    const QPoint delta = outer.topLeft() - m_announced.topLeft();
    m_announced = outer;
    const bool isByUser = std::exchange(m_isByUser, false);
    const QPoint origin = originInDesktop();
    const bool isMeasuredAnew = std::exchange(m_origin, origin) != origin;
    if (std::exchange(m_isRescaled, false))
        return announceRescaled(delta, hasResized);
    if (hasResized)
        Q_EMIT resized();
    if (hasResized && isByUser)
        m_givenUp ? Q_EMIT resizedByDesktop(fromDesktop(*m_givenUp)) : Q_EMIT resizedByUser();
    else if (!delta.isNull() && isByUser)
        announceUserMove();
    if (!hasResized && !delta.isNull())
        Q_EMIT shifted(delta);
    if (!delta.isNull() || isMeasuredAnew)
        Q_EMIT moved();
}

} // namespace penwick::platform
