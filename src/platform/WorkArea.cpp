// SPDX-License-Identifier: MIT
#include "platform/WorkArea.h"

#include <penwick/platform/Window.h>

#include "platform/ScreenCoordinates.h"
#include "platform/foundation/FatalError.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>

namespace penwick::platform {

namespace {

// The low end of `length` from `start` on, within `room` from `low` on.
double within(double start, double length, double low, double room)
{
    return std::max(low, std::min(start, low + room - length));
}

double overlap(const Rect &one, const Rect &other)
{
    const double width = std::min(one.maxX(), other.maxX()) - std::max(one.x, other.x);
    const double height = std::min(one.maxY(), other.maxY()) - std::max(one.y, other.y);
    return std::max(0.0, width) * std::max(0.0, height);
}

} // namespace

Rect broughtInside(const Rect &frame, const Rect &area, KeptEdge edge)
{
    const bool keepsTop = edge == KeptEdge::Top && frame.height > area.height;
    return { within(frame.x, frame.width, area.x, area.width),
        keepsTop ? area.maxY() - frame.height : within(frame.y, frame.height, area.y, area.height),
        frame.width, frame.height };
}

Rect broughtInsideBeside(const Rect &frame, const Rect &area, const Rect &free)
{
    const Rect nearest = broughtInside(frame, area);
    const double distance = std::max({ frame.x - free.maxX(), free.x - frame.maxX(), 0.0 });
    const Point left { free.x - distance - frame.width, frame.y };
    const Point right { free.maxX() + distance, frame.y };
    const Point above { frame.x, free.maxY() };
    const Point below { frame.x, free.y - frame.height };
    const bool isLeft = frame.maxX() <= free.x;
    for (const Point &place :
        { frame.origin(), isLeft ? right : left, isLeft ? left : right, above, below }) {
        const Rect tried = broughtInside({ place.x, place.y, frame.width, frame.height }, area);
        if (!tried.intersects(free))
            return tried;
    }
    return nearest;
}

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
