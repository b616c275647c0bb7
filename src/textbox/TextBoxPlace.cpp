// SPDX-License-Identifier: MIT
#include "textbox/TextBoxPlace.h"

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

using platform::Rect;
using platform::Size;

constexpr double leastInReach = 20.0; // points

Size inWholePoints(Size size)
{
    // A canvas that has not been laid out yet has no size; a box has at least one point.
    return { std::max(1.0, std::floor(size.width)), std::max(1.0, std::floor(size.height)) };
}

/// Where something of `length` is to begin, as near to `place` as possible, so that it ends by
/// `end`. Something longer than that begins at 0.
double within(double place, double length, double end)
{
    return std::max(0.0, std::min(place, end - length));
}

/// Where something of `length` is to begin, as near to `place` as possible, so that at least
/// `leastInReach` of it lies between 0 and `end`.
double reaching(double place, double length, double end)
{
    const double least = std::min({ leastInReach, length, end });
    return std::clamp(place, least - length, end - least);
}

} // namespace

Rect frameInSight(const Rect &frame, Size needed, Size canvas)
{
    canvas = inWholePoints(canvas);
    const double width = std::min(std::max(needed.width, smallestTextBox.width), canvas.width);
    const double height = std::min(std::max(needed.height, smallestTextBox.height), canvas.height);
    const bool hasRoom = width + roomForDeleteButton <= canvas.width
        && height + roomForDeleteButton <= canvas.height;
    const double button = hasRoom ? roomForDeleteButton : 0.0;
    return { within(frame.x, width + button, canvas.width),
        within(frame.maxY() - height, height + button, canvas.height), width, height };
}

Rect frameInReach(const Rect &frame, Size canvas)
{
    return { reaching(frame.x, frame.width, canvas.width),
        reaching(frame.y, frame.height, canvas.height), frame.width, frame.height };
}

} // namespace penwick
