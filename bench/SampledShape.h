// SPDX-License-Identifier: MIT
// What a stroke covers, found out the slow and certain way.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QSize>

#include <cstdint>
#include <span>
#include <vector>

namespace penwick::bench {

/// The shape of everything within `radius` of a chain of lines, in pixels counted upwards, by 16
/// times 16 samples in each pixel.
class SampledShape
{
public:
    SampledShape(QSize size, std::span<const platform::Point> chain, double radius);

    /// The part of a pixel that the shape covers, from 0 to 1.
    [[nodiscard]] double coverage(int x, int y) const;

private:
    void add(platform::Point from, platform::Point to, double radius);

    QSize m_size;
    std::vector<std::uint8_t> m_samples; // of all rows, the lowest first
};

} // namespace penwick::bench
