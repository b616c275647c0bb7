// SPDX-License-Identifier: MIT
#include "platform/WindowShape.h"

#include <penwick/platform/Window.h>

#include "platform/FrameTracker.h"
#include "platform/ScreenCoordinates.h"
#include "platform/native/NativeDesktop.h"

#include <cmath>

namespace penwick::platform {

namespace {

constexpr int restTime = 200; // ms
constexpr double tolerance = 2.0; // points, of rounding by the desktop

double heightFor(double width, const Size &ratio)
{
    return width * ratio.height / ratio.width;
}

} // namespace

WindowShape::WindowShape(Window &window, FrameTracker &tracker)
    : QObject(&tracker)
    , m_window(window)
    , m_tracker(tracker)
{
    m_rest.setSingleShot(true);
    m_rest.setInterval(restTime);
    connect(&m_rest, &QTimer::timeout, this, &WindowShape::correct);
    connect(&tracker, &FrameTracker::confirmed, this, &WindowShape::update);
    connect(&tracker, &FrameTracker::resizedByUser, this, [this] { m_rest.start(); });
}

bool WindowShape::isKept() const
{
    const WindowAttributes &attributes = m_window.attributes();
    return attributes.aspectRatio && (attributes.styleMask & StyleMask::resizable);
}

void WindowShape::update()
{
    if (!m_window.windowHandle())
        return;
    const Rect frame = m_tracker.frame();
    const bool hasRatio = isKept()
        && std::abs(heightFor(frame.width, *m_window.attributes().aspectRatio) - frame.height)
            < 1.0;
    // Of the content, because that is what a desktop constrains, and of this exact frame's, so
    // that asking for the frame itself stays possible.
    const QSize content = toDesktop(frame).marginsRemoved(m_tracker.margins()).size();
    NativeDesktop::instance().keepContentRatio(
        *m_window.windowHandle(), hasRatio ? content : QSize());
}

void WindowShape::correct()
{
    if (!isKept() || m_window.isMaximized() || m_window.isFullScreen())
        return;
    Rect frame = m_window.frame();
    const double height = heightFor(frame.width, *m_window.attributes().aspectRatio);
    if (std::abs(height - frame.height) <= tolerance)
        return;
    frame.y = frame.maxY() - height; // the top left corner stays
    frame.height = height;
    m_window.setFrame(frame);
}

} // namespace penwick::platform
