// SPDX-License-Identifier: MIT
// How much of each pixel a stroke covers.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QRect>

#include <cstdint>
#include <span>
#include <vector>

namespace penwick {

/// The coverage of one shape, a byte for each pixel of an area: 0 for none, 255 for all of it.
///
/// Coordinates are pixels; rows are counted upwards, like the canvas's own, and pixel (x, y) is the
/// square from there to (x + 1, y + 1). A QRect here has its lowest row in y().
///
/// The shape is a union of capsules: a line with a radius around it. Where several cover a pixel it
/// has the largest of their coverages, so neither their order nor how often one is added nor what
/// part of the area it is added to can be seen in the result.
class CoverageMask
{
public:
    /// Covers `area`, and nothing of it is covered yet.
    void reset(const QRect &area);
    [[nodiscard]] const QRect &area() const { return m_area; }

    /// The pixels of row `y` from `x` on, `width` of them; all of it inside the area.
    [[nodiscard]] std::span<const std::uint8_t> row(int x, int y, int width) const;

    /// Adds everything within `radius` pixels of the line. Gives the pixels that this may touch,
    /// inside the area or not.
    QRect addCapsule(platform::Point from, platform::Point to, double radius);
    /// Uncovers the pixels of `part`, which lies inside the area.
    void clear(const QRect &part);

private:
    [[nodiscard]] std::uint8_t *at(int x, int y);

    QRect m_area;
    std::vector<std::uint8_t> m_coverage; // the lowest row first
};

/// The pixels that a capsule around the line may touch, and with it whatever lies in the rectangle
/// between `from` and `to` with that radius around it.
[[nodiscard]] QRect pixelsOfCapsule(platform::Point from, platform::Point to, double radius);

} // namespace penwick
