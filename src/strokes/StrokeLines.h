// SPDX-License-Identifier: MIT
// A path as the straight lines that it is painted and hit by.
#pragma once

#include <penwick/platform/BezierPath.h>

#include <vector>

namespace penwick {

/// A straight line; where both points are the same, a dot.
struct StrokeLine
{
    platform::Point from;
    platform::Point to;
};

/// All lines of `path`, in order, for a path that is no chain; chords stand for its curves, and lie
/// closer to them than anybody can see.
[[nodiscard]] std::vector<StrokeLine> linesOf(const platform::BezierPath &path);

/// Hands the lines of `path` to `visit`, in order, until it returns true; whether it did. The first
/// `skipped` lines of a chain are left out.
template <class Visit>
bool visitLines(const platform::BezierPath &path, Visit visit, std::size_t skipped = 0)
{
    const auto points = path.chain();
    for (std::size_t index = skipped + 1; index < points.size(); ++index) {
        if (visit(StrokeLine { points[index - 1], points[index] }))
            return true;
    }
    if (!points.empty())
        return false;
    for (const StrokeLine &line : linesOf(path)) {
        if (visit(line))
            return true;
    }
    return false;
}

} // namespace penwick
