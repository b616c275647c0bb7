// SPDX-License-Identifier: MIT
#include "platform/window/WorkArea.h"

#include <penwick/platform/ScreenFrame.h>

#include "platform/foundation/FatalError.h"
#include "platform/window/ScreenCoordinates.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>

namespace penwick::platform {

namespace {

double overlap(const Rect &one, const Rect &other)
{
    const double width = std::min(one.maxX(), other.maxX()) - std::max(one.x, other.x);
    const double height = std::min(one.maxY(), other.maxY()) - std::max(one.y, other.y);
    return std::max(0.0, width) * std::max(0.0, height);
}

} // namespace

Rect workAreaFor(const Rect &frame)
{
    const QScreen *chosen = require(QGuiApplication::primaryScreen(), "there is no primary screen");
    double most = 0.0;
    for (const QScreen *const screen : QGuiApplication::screens()) {
        const double shared = overlap(frame, frameOfScreen(*screen));
        if (shared > most) {
            most = shared;
            chosen = screen;
        }
    }
    const QRect area = chosen->availableGeometry() & chosen->geometry();
    return fromDesktop(area.isEmpty() ? chosen->geometry() : area);
}

} // namespace penwick::platform
