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
/// The shape is made of capsules; a capsule is all that lies within a radius of a line. A pixel
/// that several capsules cover has the largest of their coverages. The result therefore depends
/// neither on the order in which capsules are added, nor on how often one is added, nor on how the
/// area is divided when only parts of it are painted.
class CoverageMask
{
public:
    /// Makes this a mask of `area`, in which every pixel has the coverage 0.
    void reset(const QRect &area);
    [[nodiscard]] const QRect &area() const { return m_area; }

    /// The coverage of `width` pixels of row `y`, from column `x` on. All of them must lie inside
    /// the area.
    [[nodiscard]] std::span<const std::uint8_t> row(int x, int y, int width) const;

    /// Adds everything within `radius` pixels of the line. Returns the pixels that the capsule may
    /// touch, also those outside the area, which the mask does not hold.
    QRect addCapsule(platform::Point from, platform::Point to, double radius);
    /// Sets the pixels of `part` back to the coverage 0. `part` must lie inside the area.
    void clear(const QRect &part);

private:
    [[nodiscard]] std::uint8_t *at(int x, int y);

    QRect m_area;
    std::vector<std::uint8_t> m_coverage; // the lowest row first
};

/// The pixels that a capsule around the line may touch: the rectangle that `from` and `to` span,
/// grown by the radius. It holds for every other shape inside that grown rectangle too.
[[nodiscard]] QRect pixelsOfCapsule(platform::Point from, platform::Point to, double radius);

} // namespace penwick
