// SPDX-License-Identifier: MIT
#include "desktop/support/Pointer.h"

#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <X11/Xlib.h>

#include <X11/extensions/XTest.h>
#include <X11/extensions/Xfixes.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <memory>
#include <stdexcept>

namespace penwick::desktop {

namespace {

constexpr int stepLength = 4; // pixels between two reports of a mouse moved at a normal speed
constexpr unsigned long stepTime = 4; // milliseconds; the server keeps the time
constexpr unsigned long restTime = 100; // likewise

} // namespace

Pointer::Pointer(const XConnection &connection)
    : m_connection(connection)
{
    int ignored = 0;
    if (!XTestQueryExtension(connection.display(), &ignored, &ignored, &ignored, &ignored))
        throw std::runtime_error("the X server has no test extension");
    if (!XFixesQueryExtension(connection.display(), &ignored, &ignored))
        throw std::runtime_error("the X server has no fixes extension");
}

void Pointer::moveTo(QPoint place)
{
    XTestFakeMotionEvent(m_connection.display(), -1, place.x(), place.y(), CurrentTime);
    m_connection.finish();
}

void Pointer::press(MouseButton button)
{
    setButton(button, true);
}

void Pointer::release(MouseButton button)
{
    setButton(button, false);
}

void Pointer::click(QPoint place, MouseButton button)
{
    moveTo(place);
    press(button);
    release(button);
}

void Pointer::glideTo(QPoint place)
{
    const QPointF start = this->place();
    const QPointF way = QPointF(place) - start;
    const double length = std::hypot(way.x(), way.y());
    const int steps = std::max(1, static_cast<int>(std::ceil(length / stepLength)));
    for (int step = 1; step <= steps; ++step) {
        const QPoint next = (start + way * step / steps).toPoint();
        XTestFakeMotionEvent(m_connection.display(), -1, next.x(), next.y(), stepTime);
    }
    m_connection.finish();
}

void Pointer::takeHold(QPoint place)
{
    moveTo(place);
    press();
    rest();
}

void Pointer::letGo()
{
    rest();
    release();
}

void Pointer::rest()
{
    const QPoint here = place();
    XTestFakeMotionEvent(m_connection.display(), -1, here.x(), here.y(), restTime);
    m_connection.finish();
}

void Pointer::drag(const std::vector<QPoint> &places, MouseButton button)
{
    moveTo(places.front());
    press(button);
    std::for_each(places.begin() + 1, places.end(), [this](QPoint place) { glideTo(place); });
    release(button);
}

QPoint Pointer::place() const
{
    return state().place;
}

Pointer::State Pointer::state() const
{
    Window root = 0;
    Window child = 0;
    int x = 0;
    int y = 0;
    int ignored = 0;
    unsigned int buttons = 0;
    XQueryPointer(m_connection.display(), m_connection.root(), &root, &child, &x, &y, &ignored,
        &ignored, &buttons);
    return { { x, y }, buttons };
}

CursorLook Pointer::look() const
{
    const std::unique_ptr<XFixesCursorImage, int (*)(void *)> cursor(
        XFixesGetCursorImage(m_connection.display()), &XFree);
    if (!cursor)
        return {};
    QImage image(cursor->width, cursor->height, QImage::Format_ARGB32_Premultiplied);
    for (int y = 0; y < image.height(); ++y) {
        const auto above = static_cast<std::ptrdiff_t>(y) * image.width();
        const unsigned long *const row = cursor->pixels + above;
        std::transform(row, row + image.width(), reinterpret_cast<QRgb *>(image.scanLine(y)),
            [](unsigned long pixel) { return static_cast<QRgb>(pixel); });
    }
    return { image, { cursor->xhot, cursor->yhot } };
}

void Pointer::setButton(MouseButton button, bool isDown)
{
    XTestFakeButtonEvent(m_connection.display(), static_cast<unsigned int>(button),
        isDown ? True : False, CurrentTime);
    m_connection.finishWithWindowManager();
    // A window manager that holds the pointer at the press may answer before it lets go. Until then
    // the server keeps the release, and would tell it with the place to which the pointer is moved
    // next.
    if (!isDown)
        require([&] { return !isPressed(button); }, "the button to be let go");
}

bool Pointer::isPressed(MouseButton button) const
{
    return (state().buttons & (Button1Mask << (static_cast<unsigned int>(button) - 1))) != 0;
}

} // namespace penwick::desktop
