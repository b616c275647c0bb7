// SPDX-License-Identifier: MIT
#include "platform/window/ScreenCoordinates.h"

#include <penwick/platform/ScreenFrame.h>

#include "platform/foundation/FatalError.h"

#include <QGuiApplication>
#include <QScreen>

#include <cmath>

namespace penwick::platform {

QPoint originInDesktop()
{
    const QScreen *const primary
        = require(QGuiApplication::primaryScreen(), "there is no primary screen");
    const QRect area = primary->geometry();
    return { area.x(), area.y() + area.height() };
}

QPoint fromPixels(QPoint pixels, QPoint screen, double scale)
{
    return screen + (QPointF(pixels - screen) / scale).toPoint();
}

Rect fromDesktop(const QRectF &rect)
{
    const QPoint origin = originInDesktop();
    return { rect.x() - origin.x(), origin.y() - rect.y() - rect.height(), rect.width(),
        rect.height() };
}

QRectF toDesktopExactly(const Rect &rect)
{
    const QPoint origin = originInDesktop();
    return { origin.x() + rect.x, origin.y() - rect.maxY(), rect.width, rect.height };
}

QRect rounded(const QRectF &rect)
{
    const auto whole = [](double value) { return static_cast<int>(std::lround(value)); };
    return { whole(rect.x()), whole(rect.y()), whole(rect.width()), whole(rect.height()) };
}

QRect toDesktop(const Rect &rect)
{
    return rounded(toDesktopExactly(rect));
}

Rect frameOfScreen(const QScreen &screen)
{
    return fromDesktop(screen.geometry());
}

} // namespace penwick::platform
