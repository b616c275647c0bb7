// SPDX-License-Identifier: MIT
// Where a pointer that moves in a straight line meets a stroke.
#pragma once

#include <penwick/platform/Geometry.h>

#include <optional>

namespace penwick::platform {
class BezierPath;
}

namespace penwick {

/// The straight way of a pointer from one event to the next.
struct Way
{
    platform::Point from;
    platform::Point to;

    [[nodiscard]] double length() const;
    /// The point at `part` of the way: 0 is its beginning, 1 its end.
    [[nodiscard]] platform::Point at(double part) const;
};

/// How a pointer meets a stroke on its way.
struct Meeting
{
    /// The first part of the way, as in Way::at(), at which strokeContains() holds. A way may begin
    /// on the stroke. Up to a millionth of a point is added, so that rounding cannot put the place
    /// just outside the stroke. Empty where the way misses the stroke, meets it only at its end or
    /// for too short a piece to be sure of, or has no length.
    std::optional<double> part;
    bool isAtEnd = false; ///< whether strokeContains() holds at the end
};

[[nodiscard]] Meeting meetingOn(const Way &way, const platform::BezierPath &path);

} // namespace penwick
