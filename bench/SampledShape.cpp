// SPDX-License-Identifier: MIT
#include "SampledShape.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

namespace penwick::bench {

namespace {

constexpr int samplesAcross = 16;

} // namespace

SampledShape::SampledShape(QSize size, std::span<const platform::Point> chain, double radius)
    : m_size(size * samplesAcross)
    , m_samples(
          static_cast<std::size_t>(m_size.width()) * static_cast<std::size_t>(m_size.height()))
{
    for (std::size_t index = 1; index < chain.size(); ++index)
        add(chain[index - 1], chain[index], radius);
}

void SampledShape::add(platform::Point from, platform::Point to, double radius)
{
    const auto lowest = [&](double a, double b) {
        return std::max(0, static_cast<int>((std::min(a, b) - radius) * samplesAcross) - 1);
    };
    const auto highest = [&](double a, double b, int length) {
        return std::min(
            length - 1, static_cast<int>((std::max(a, b) + radius) * samplesAcross) + 1);
    };
    const double alongX = to.x - from.x;
    const double alongY = to.y - from.y;
    const double lengthSquared = alongX * alongX + alongY * alongY;
    for (int y = lowest(from.y, to.y); y <= highest(from.y, to.y, m_size.height()); ++y) {
        auto *const row = m_samples.data()
            + static_cast<std::ptrdiff_t>(y) * static_cast<std::ptrdiff_t>(m_size.width());
        const double awayY = (y + 0.5) / samplesAcross - from.y;
        for (int x = lowest(from.x, to.x); x <= highest(from.x, to.x, m_size.width()); ++x) {
            if (row[x])
                continue;
            const double awayX = (x + 0.5) / samplesAcross - from.x;
            const double part = lengthSquared > 0.0
                ? std::clamp((awayX * alongX + awayY * alongY) / lengthSquared, 0.0, 1.0)
                : 0.0;
            const double restX = awayX - part * alongX;
            const double restY = awayY - part * alongY;
            row[x] = restX * restX + restY * restY <= radius * radius;
        }
    }
}

double SampledShape::coverage(int x, int y) const
{
    int covered = 0;
    for (int row = y * samplesAcross; row < (y + 1) * samplesAcross; ++row) {
        const auto start = m_samples.begin() + static_cast<std::ptrdiff_t>(row) * m_size.width()
            + static_cast<std::ptrdiff_t>(x) * samplesAcross;
        covered += static_cast<int>(std::count(start, start + samplesAcross, 1));
    }
    return static_cast<double>(covered) / (samplesAcross * samplesAcross);
}

} // namespace penwick::bench
