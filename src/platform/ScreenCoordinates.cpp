// SPDX-License-Identifier: MIT
#include "platform/ScreenCoordinates.h"

#include <penwick/platform/Window.h>

#include "platform/foundation/FatalError.h"

#include <QGuiApplication>
#include <QScreen>

#include <cmath>

namespace penwick::platform {

namespace {

QPoint primaryBottomLeft()
{
    const QScreen *const primary
        = require(QGuiApplication::primaryScreen(), "there is no primary screen");
    const QRect area = primary->geometry();
    return { area.x(), area.y() + area.height() };
}

} // namespace

Rect fromDesktop(const QRect &rect)
{
    const QPoint origin = primaryBottomLeft();
    return { static_cast<double>(rect.x() - origin.x()),
        static_cast<double>(origin.y() - rect.y() - rect.height()),
        static_cast<double>(rect.width()), static_cast<double>(rect.height()) };
}

QRect toDesktop(const Rect &rect)
{
    const QPoint origin = primaryBottomLeft();
    const auto rounded = [](double value) { return static_cast<int>(std::lround(value)); };
    return { rounded(origin.x() + rect.x), rounded(origin.y() - rect.maxY()), rounded(rect.width),
        rounded(rect.height) };
}

Rect frameOfScreen(const QScreen &screen)
{
    return fromDesktop(screen.geometry());
}

} // namespace penwick::platform
