// SPDX-License-Identifier: MIT
#include "platform/FrameTracker.h"

#include "platform/ScreenCoordinates.h"
#include "platform/native/NativeDesktop.h"

#include <QEvent>
#include <QWidget>
#include <QWindow>

namespace penwick::platform {

namespace {

// How often, and after what time each, a request that was not granted is looked at again before
// what stands there is taken for the answer. The desktop does not announce every step of its own.
constexpr int looks = 6;
constexpr int lookInterval = 50; // ms

} // namespace

FrameTracker::FrameTracker(QWidget &window)
    : QObject(&window)
    , m_window(window)
    , m_frame(fromDesktop(window.geometry()))
{
    m_check.setSingleShot(true);
    m_check.setInterval(0);
    connect(&m_check, &QTimer::timeout, this, &FrameTracker::check);
    m_patience.setInterval(lookInterval);
    connect(&m_patience, &QTimer::timeout, this, &FrameTracker::lookAgain);
    m_window.installEventFilter(this);
}

FrameTracker::~FrameTracker() = default;

Rect FrameTracker::frame() const
{
    return m_frame;
}

void FrameTracker::request(const Rect &frame)
{
    m_frame = frame;
    if (!m_window.isVisible()) {
        // Nobody has decorated it yet, so its content may be laid out as if nobody will.
        m_window.resize(toDesktop(frame).size());
        return;
    }
    applyRequest();
    awaitAnswer();
    m_check.start();
}

void FrameTracker::prepareToShow()
{
    m_window.winId(); // the desktop can only be asked about a window that exists
    QWindow &native = *m_window.windowHandle();
    if (m_window.windowFlags().testFlag(Qt::FramelessWindowHint)) {
        m_margins = QMargins();
    } else if (const auto margins = NativeDesktop::instance().frameMarginsBeforeShow(native)) {
        m_margins = *margins / native.devicePixelRatio();
    } else {
        m_margins = native.frameMargins();
    }
    applyRequest();
    m_announced = toDesktop(m_frame);
    awaitAnswer();
}

void FrameTracker::applyRequest()
{
    m_window.setGeometry(toDesktop(m_frame).marginsRemoved(m_margins));
}

bool FrameTracker::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::Show:
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
    return m_window.windowHandle()->frameGeometry();
}

void FrameTracker::check()
{
    if (!m_window.isVisible() || m_window.isMinimized())
        return;
    if (isDecoratedAnew()) {
        m_margins = m_window.windowHandle()->frameMargins();
        applyRequest();
        awaitAnswer();
        return;
    }
    const QRect outer = outerGeometry();
    if (outer != toDesktop(m_frame)) {
        if (m_isPending)
            return; // until the desktop answers or patience ends
        m_frame = fromDesktop(outer);
    }
    m_isPending = false;
    m_patience.stop();
    announce();
}

// Another title bar is the desktop's doing and not the user's, so the frame that was asked for
// still holds. A window that was just shown has no margins at all until it is decorated.
bool FrameTracker::isDecoratedAnew() const
{
    const QMargins margins = m_window.windowHandle()->frameMargins();
    return margins != m_margins && !(m_isPending && margins.isNull())
        && !m_window.windowState().testAnyFlags(Qt::WindowMaximized | Qt::WindowFullScreen);
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
        m_isPending = false;
    }
    check();
}

void FrameTracker::announce()
{
    const QRect outer = toDesktop(m_frame);
    const bool hasResized = outer.size() != m_announced.size();
    const QPoint delta = outer.topLeft() - m_announced.topLeft();
    m_announced = outer;
    if (hasResized)
        Q_EMIT resized();
    else if (!delta.isNull())
        Q_EMIT shifted(delta);
    if (!delta.isNull())
        Q_EMIT moved();
}

} // namespace penwick::platform
