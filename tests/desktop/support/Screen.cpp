// SPDX-License-Identifier: MIT
#include "desktop/support/Screen.h"

#include "desktop/support/XConnection.h"

#include <X11/Xlib.h>

#include <X11/Xutil.h>

#include <memory>
#include <stdexcept>

namespace penwick::desktop {

Screen::Screen(const XConnection &connection)
    : m_connection(connection)
{ }

QSize Screen::size() const
{
    Display *const display = m_connection.display();
    return { DisplayWidth(display, DefaultScreen(display)),
        DisplayHeight(display, DefaultScreen(display)) };
}

QImage Screen::picture() const
{
    return picture(QRect(QPoint(0, 0), size()));
}

QImage Screen::picture(const QRect &area) const
{
    const auto destroy = [](XImage *image) { XDestroyImage(image); };
    const std::unique_ptr<XImage, decltype(destroy)> source(
        XGetImage(m_connection.display(), m_connection.root(), area.x(), area.y(),
            static_cast<unsigned int>(area.width()), static_cast<unsigned int>(area.height()),
            AllPlanes, ZPixmap),
        destroy);
    if (!source)
        throw std::runtime_error("no picture of the screen");
    QImage image(area.size(), QImage::Format_RGB32);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            image.setPixel(x, y, 0xff000000U | static_cast<QRgb>(XGetPixel(source.get(), x, y)));
    }
    return image;
}

QColor Screen::pixel(QPoint place) const
{
    return picture(QRect(place, QSize(1, 1))).pixelColor(0, 0);
}

} // namespace penwick::desktop
