// SPDX-License-Identifier: MIT
#include "platform/foundation/Placement.h"

#include <algorithm>

namespace penwick::platform {

namespace {

// Where something of `length` begins, as near to `start` as possible, within `room` from `low` on.
double within(double start, double length, double low, double room)
{
    return std::max(low, std::min(start, low + room - length));
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

} // namespace penwick::platform
