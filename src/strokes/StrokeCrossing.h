// SPDX-License-Identifier: MIT
// Where a pointer that goes straight on comes upon a stroke.
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
    /// 0 is where it begins, 1 where it ends.
    [[nodiscard]] platform::Point at(double part) const;
};

/// How a pointer meets a stroke on its way.
struct Meeting
{
    /// How far along the way strokeContains() first holds for its points, or did at its beginning;
    /// a millionth of a point is added, so that it surely holds there. Nothing where the stroke is
    /// not met, where it is met only at the end or for less than can be told, and for a way
    /// without length.
    std::optional<double> part;
    bool isAtEnd = false; ///< whether strokeContains() holds at the end
};

[[nodiscard]] Meeting meetingOn(const Way &way, const platform::BezierPath &path);

} // namespace penwick
