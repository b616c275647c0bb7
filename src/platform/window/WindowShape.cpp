// SPDX-License-Identifier: MIT
#include "platform/window/WindowShape.h"

#include "platform/foundation/KeptShape.h"
#include "platform/native/NativeDesktop.h"
#include "platform/window/FrameTracker.h"
#include "platform/window/ScreenCoordinates.h"
#include "platform/window/WorkArea.h"

#include <QWidget>
#include <QWindow>

#include <cmath>
#include <utility>

namespace penwick::platform {

namespace {

constexpr Clock::Time restTime { 200 };
constexpr double tolerance = 2.0; // points, of rounding by the desktop

double heightFor(double width, const Size &ratio)
{
    return width * ratio.height / ratio.width;
}

bool hasShape(const Size &size, const Size &ratio)
{
    return std::abs(heightFor(size.width, ratio) - size.height) <= tolerance;
}

} // namespace

WindowShape::WindowShape(QWidget &window, FrameTracker &tracker)
    : QObject(&tracker)
    , m_window(window)
    , m_tracker(tracker)
{
    connect(&m_rest, &Alarm::rang, this, &WindowShape::rest);
    connect(&tracker, &FrameTracker::asking, this,
        [this](const QRect &content) { keep(content.size()); });
    connect(&tracker, &FrameTracker::confirmed, this,
        [this] { keep(toDesktop(m_tracker.frame()).marginsRemoved(m_tracker.margins()).size()); });
    connect(&tracker, &FrameTracker::resizedByUser, this, [this] { await(true); });
    connect(&tracker, &FrameTracker::resizedByDesktop, this, [this](const Rect &asked) {
        if (m_ratio && hasShape(asked.size(), *m_ratio))
            await(false);
    });
    connect(&tracker, &FrameTracker::settled, this, &WindowShape::rememberFrame);
}

// The hint is written before the desktop is asked for a frame, because some desktops measure what
// is asked for by a hint that is still that of another size. It is about the content, because that
// is what a desktop constrains, and has the very size of this content, so that the frame itself can
// still be asked for.
void WindowShape::keep(const QSize &content)
{
    QWindow *const window = m_window.windowHandle();
    if (!window)
        return;
    if (!m_isResizable)
        NativeDesktop::instance().keepContentSize(*window, content);
    const QSize frame = content.grownBy(m_tracker.margins());
    const bool hasRatio
        = m_ratio && std::abs(heightFor(frame.width(), *m_ratio) - frame.height()) < 1.0;
    NativeDesktop::instance().keepContentRatio(*window, hasRatio ? content : QSize());
}

void WindowShape::setResizable(bool isResizable)
{
    if (std::exchange(m_isResizable, isResizable) == isResizable || !m_window.windowHandle())
        return;
    NativeDesktop::instance().keepContentSize(
        *m_window.windowHandle(), isResizable ? QSize() : m_window.size());
}

// Whether the desktop decides the window's size. The size before comes back afterwards.
bool WindowShape::isArranged() const
{
    return m_window.isMaximized() || m_window.isFullScreen();
}

void WindowShape::rememberFrame()
{
    if (std::exchange(m_isAnswering, false))
        m_rest.cancel(); // another size than the correction's is the desktop's, not a pull
    if (!m_rest.at() && !isArranged())
        m_before = m_tracker.frame();
}

void WindowShape::await(bool isPulled)
{
    m_isPulled = isPulled;
    if (!m_rest.at()) // once for each pull: the desktop has to be asked
        m_isByHand = NativeDesktop::instance().isPointerHeld();
    awaitRest();
}

void WindowShape::awaitRest()
{
    m_rest.set(Clock::ofTheUser().now() + restTime);
}

// While the button is held nothing is corrected: the user would go on pulling from another size
// than the one that is seen.
void WindowShape::rest()
{
    if (NativeDesktop::instance().isPointerHeld()) {
        m_isByHand = true;
        return awaitRest();
    }
    correct();
    if (!m_isAnswering)
        rememberFrame();
}

void WindowShape::correct()
{
    if (!m_ratio || isArranged())
        return;
    const Rect pulled = m_tracker.frame();
    const Size ratio = *m_ratio;
    const bool isChanged = m_before != Rect() && m_before.size() != pulled.size();
    if (hasShape(pulled.size(), ratio) || (m_isPulled && !isChanged))
        return;
    Q_EMIT corrected(shaped(pulled, ratio));
    m_isAnswering = true;
}

Rect WindowShape::shaped(const Rect &changed, const Size &ratio) const
{
    if (!m_isPulled) {
        const double height = heightFor(changed.width, ratio);
        return { changed.x, changed.maxY() - height, changed.width, height };
    }
    const Rect area = workAreaFor(changed);
    // Without a hand at its edges, the desktop has put it into a part of the screen: no pull
    // outward, though it may have become higher.
    if (!m_isByHand && spans(changed, area))
        return shapedInside(changed, ratio);
    return shapedAfterPull(m_before, changed, ratio, area);
}

} // namespace penwick::platform
