// SPDX-License-Identifier: MIT
// A path as straight lines, from which it is painted and searched for hits.
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

/// All lines of `path`, in order. Instead of each curve it gives chords that are closer to the
/// curve than anybody can see. For a chain use visitLines(), which makes no list.
[[nodiscard]] std::vector<StrokeLine> linesOf(const platform::BezierPath &path);

/// Calls `visit` with each line of `path`, in order, until `visit` returns true; returns whether it
/// did. If `path` is a chain, its first `skipped` lines are left out.
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
