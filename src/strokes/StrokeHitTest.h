// SPDX-License-Identifier: MIT
// Whether a point lies on a stroke.
#pragma once

#include <penwick/platform/Geometry.h>

namespace penwick::platform {
class BezierPath;
}

namespace penwick {

struct StrokeLine;

/// Whether `point` is at most half the path's line width away from its centre line; exactly half is
/// a hit. Ends and joins are round. A line that ends where it began is a dot, round as well; a path
/// without lines and curves is hit nowhere. A point far away is answered from the path's bounds.
[[nodiscard]] bool strokeContains(const platform::BezierPath &path, platform::Point point);

/// The same for one line of a stroke that is twice `radius` thick.
[[nodiscard]] bool lineContains(const StrokeLine &line, double radius, platform::Point point);

} // namespace penwick
