// SPDX-License-Identifier: MIT
#include "platform/foundation/KeptShape.h"

#include "platform/foundation/Placement.h"

#include <algorithm>
#include <cmath>

namespace penwick::platform {

namespace {

// An edge that moved by less than this was not pulled: places and sizes are rounded separately, and
// a desktop may be wrong by the width of a border.
constexpr double samePlace = 2.5; // points

// By how much `size` shrinks to fit into `room`; never grows.
double shrinkage(const Size &size, const Size &room)
{
    return std::min({ 1.0, room.width / size.width, room.height / size.height });
}

} // namespace

Rect broughtInsideInShape(const Rect &frame, const Rect &area)
{
    const double scale = shrinkage(frame.size(), area.size());
    return broughtInside({ frame.x, frame.y, frame.width * scale, frame.height * scale }, area);
}

Size scaledDownInto(const Size &picture, const Size &room)
{
    const double scale = shrinkage(picture, room);
    if (scale == 1.0)
        return picture;
    return { std::max(1.0, std::round(picture.width * scale)),
        std::max(1.0, std::round(picture.height * scale)) };
}

Rect shapedAfterPull(const Rect &before, const Rect &pulled, const Size &ratio, const Rect &area)
{
    const bool isOutward = pulled.width > before.width || pulled.height > before.height;
    const double asHigh = pulled.height * ratio.width / ratio.height;
    const double width
        = isOutward ? std::max(pulled.width, asHigh) : std::min(pulled.width, asHigh);
    const double height = width * ratio.height / ratio.width;
    const auto isKept = [](double one, double other) { return std::abs(one - other) < samePlace; };
    const bool keepsRight = isKept(before.maxX(), pulled.maxX()) && !isKept(before.x, pulled.x);
    const bool keepsBottom = isKept(before.y, pulled.y) && !isKept(before.maxY(), pulled.maxY());
    const Rect shaped { keepsRight ? pulled.maxX() - width : pulled.x,
        keepsBottom ? pulled.y : pulled.maxY() - height, width, height };
    return shrinkage(shaped.size(), area.size()) < 1.0 ? broughtInsideInShape(shaped, area)
                                                       : shaped;
}

bool spans(const Rect &frame, const Rect &area)
{
    const auto isSame = [](double one, double other) { return std::abs(one - other) < samePlace; };
    return (isSame(frame.x, area.x) && isSame(frame.maxX(), area.maxX()))
        || (isSame(frame.y, area.y) && isSame(frame.maxY(), area.maxY()));
}

Rect shapedInside(const Rect &frame, const Size &ratio)
{
    const double width = std::min(frame.width, frame.height * ratio.width / ratio.height);
    const double height = width * ratio.height / ratio.width;
    return { frame.x, frame.maxY() - height, width, height };
}

} // namespace penwick::platform
