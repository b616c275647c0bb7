// SPDX-License-Identifier: MIT
#include "strokes/CoverageMask.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <utility>

namespace penwick {

namespace {

using platform::Point;

// An edge touches no pixel whose centre is farther from it than half a pixel's diagonal.
constexpr float edgeReach = 0.7072F; // pixels
constexpr float fullCoverage = 255.0F;

// Added to a coverage before its fraction is cut off. It is a little less than a half because edges
// through the middle of a pixel are frequent: with a half, the smallest error of calculation would
// make 127 of one such pixel and 128 of the next.
constexpr float rounding = 0.49F;
constexpr std::size_t blockSize = 64; // pixels worked on at a time

// Coordinates beyond this are moved to it, so that they fit into an int. It is far more than any
// screen has: what this bends in a line lies where nobody sees it.
constexpr double farthest = 1e6; // pixels
// From any place to any other it is less far than this, so a larger radius would look the same.
constexpr double largestRadius = 4 * farthest;

double limited(double coordinate)
{
    return std::clamp(coordinate, -farthest, farthest);
}

Point limited(Point point)
{
    return { limited(point.x), limited(point.y) };
}

// std::max() and std::min() take and return references, which keeps the compiler from working on
// several pixels at once. These functions take and return values.
inline float larger(float a, float b)
{
    return a > b ? a : b;
}

inline float smaller(float a, float b)
{
    return a < b ? a : b;
}

/// How much of a pixel lies on the inner side of a straight edge, from 0 to 1. `inside` is the
/// distance of the pixel's centre from the edge, negative on the outer side. `along` and `across`
/// are the components, without their signs, of the unit vector at a right angle to the edge.
inline float coveredByEdge(float inside, float along, float across)
{
    const float steep = larger(along, across);
    const float flat = smaller(along, across);
    const float depth = std::abs(inside);
    // This is the area of the smaller of the two parts into which the edge cuts the pixel. An edge
    // far from the centre cuts off a corner, a triangle. An edge nearer to the centre crosses two
    // opposite sides: the part is then the largest such triangle and a strip, which grows evenly
    // towards the centre. There are no branches, so that the compiler can work on several pixels
    // at once.
    const float corner = smaller(larger(0.5F * (steep + flat) - depth, 0.0F), flat);
    const float triangle = 0.5F * corner * corner / larger(steep * flat, 1e-6F);
    const float beforeCorner = larger(0.5F * (steep - flat) - depth, 0.0F) / larger(steep, 0.5F);
    const float moreThanHalf = 0.5F - triangle - beforeCorner;
    return 0.5F + std::copysign(moreThanHalf, inside);
}

/// A capsule, with all that is computed once for its many pixels. Its numbers are relative to the
/// pixel in which its line begins, so that they are small, and exact, wherever the capsule lies.
class Capsule
{
public:
    Capsule(Point from, Point to, double radius)
        : m_originX(static_cast<int>(std::floor(from.x)))
        , m_originY(static_cast<int>(std::floor(from.y)))
        , m_startX(static_cast<float>(from.x - m_originX))
        , m_startY(static_cast<float>(from.y - m_originY))
        , m_x(static_cast<float>(to.x - from.x))
        , m_y(static_cast<float>(to.y - from.y))
        , m_radius(static_cast<float>(radius))
        , m_endRecess(1.0F / (24.0F * std::max(m_radius, edgeReach)))
    {
        const float lengthSquared = m_x * m_x + m_y * m_y;
        if (lengthSquared <= 0.0F)
            return;
        m_perLengthSquared = 1.0F / lengthSquared;
        const float perLength = 1.0F / std::sqrt(lengthSquared);
        m_sideAlong = std::abs(m_y) * perLength;
        m_sideAcross = std::abs(m_x) * perLength;
    }

    /// The coverage of the pixels from (x, y) on, as numbers from 0 to 255.
    void cover(int x, int y, std::span<float> pixels) const
    {
        if (m_radius < edgeReach)
            coverAs<true>(x, y, pixels);
        else
            coverAs<false>(x, y, pixels);
    }

    /// Narrows the columns [first, last) of row `y` to those in which pixels may be covered.
    /// Afterwards `first` is not less than `last` if there are none.
    void narrow(int y, int &first, int &last) const
    {
        const float reach = m_radius + edgeReach;
        const float above = static_cast<float>(y - m_originY) + 0.5F - m_startY;
        float start = 0.0F;
        float end = 1.0F;
        if (std::abs(m_y) > 1e-3F) {
            const float one = (above - reach) / m_y;
            const float other = (above + reach) / m_y;
            start = std::clamp(std::min(one, other), 0.0F, 1.0F);
            end = std::clamp(std::max(one, other), 0.0F, 1.0F);
        }
        const float left = m_startX + std::min(start * m_x, end * m_x) - reach;
        const float right = m_startX + std::max(start * m_x, end * m_x) + reach;
        first = std::max(first, m_originX + static_cast<int>(std::floor(left)));
        last = std::min(last, m_originX + static_cast<int>(std::floor(right)) + 1);
    }

    /// Narrows the columns [first, last) of row `y` to some in which every pixel is wholly covered.
    /// Afterwards `first` is not less than `last` if none was found.
    void findInside(int y, int &first, int &last) const
    {
        const float reach = m_radius - edgeReach;
        const float above = static_cast<float>(y - m_originY) + 0.5F - m_startY;
        float left = 1e9F;
        float right = -1e9F;
        const auto addDisc = [&](float x, float height) {
            const float chordSquared = reach * reach - height * height;
            if (chordSquared < 0.0F)
                return;
            const float chord = std::sqrt(chordSquared);
            left = std::min(left, x - chord);
            right = std::max(right, x + chord);
        };
        addDisc(m_startX, above);
        addDisc(m_startX + m_x, above - m_y);
        // The row crosses the line between its ends, so the disc around that point counts too.
        if (std::abs(m_y) > 1e-3F && above / m_y > 0.0F && above / m_y < 1.0F)
            addDisc(m_startX + m_x * (above / m_y), 0.0F);
        first = std::max(first, m_originX + static_cast<int>(std::ceil(left)));
        last = std::min(last, m_originX + static_cast<int>(std::floor(right)));
    }

private:
    template <bool isThin>
    void coverAs(int x, int y, std::span<float> pixels) const
    {
        const float firstX = static_cast<float>(x - m_originX) + 0.5F - m_startX;
        const float centerY = static_cast<float>(y - m_originY) + 0.5F - m_startY;
        const int count = static_cast<int>(pixels.size());
        float *const out = pixels.data();
        for (int index = 0; index < count; ++index) {
            const float centerX = firstX + static_cast<float>(index);
            const float part = (centerX * m_x + centerY * m_y) * m_perLengthSquared;
            const float nearest = smaller(larger(part, 0.0F), 1.0F);
            const float awayX = centerX - nearest * m_x;
            const float awayY = centerY - nearest * m_y;
            const float distance = std::sqrt(awayX * awayX + awayY * awayY);
            const float perDistance = 1.0F / larger(distance, 1e-6F);
            const float isAtEnd = part == nearest && m_perLengthSquared > 0.0F ? 0.0F : 1.0F;
            const float along
                = m_sideAlong + isAtEnd * (std::abs(awayX) * perDistance - m_sideAlong);
            const float across
                = m_sideAcross + isAtEnd * (std::abs(awayY) * perDistance - m_sideAcross);
            const float radius = m_radius - isAtEnd * m_endRecess;
            float covered = coveredByEdge(radius - distance, along, across);
            if constexpr (isThin) // the opposite edge crosses the pixel too
                covered -= 1.0F - coveredByEdge(radius + distance, along, across);
            out[index] = smaller(larger(covered, 0.0F), 1.0F) * fullCoverage + rounding;
        }
    }

    int m_originX;
    int m_originY;
    float m_startX;
    float m_startY;
    float m_x;
    float m_y;
    float m_radius;
    float m_perLengthSquared = 0.0F;
    float m_sideAlong = 0.0F;
    float m_sideAcross = 0.0F;
    // Each pixel is computed as if its edge were straight, but the ends are round. Inside a pixel
    // the arc lies this far behind the straight edge, on average.
    float m_endRecess;
};

void coverSpan(const Capsule &capsule, int x, int y, std::span<std::uint8_t> pixels)
{
    std::array<float, blockSize> block;
    while (!pixels.empty()) {
        const std::size_t size = std::min(pixels.size(), blockSize);
        capsule.cover(x, y, std::span(block.data(), size));
        for (std::size_t index = 0; index < size; ++index) {
            const auto covered = static_cast<std::uint8_t>(static_cast<int>(block[index]));
            pixels[index] = std::max(pixels[index], covered);
        }
        pixels = pixels.subspan(size);
        x += static_cast<int>(size);
    }
}

} // namespace

QRect pixelsOfCapsule(Point from, Point to, double radius)
{
    const auto below = [](double value) { return static_cast<int>(std::floor(limited(value))); };
    const double reach = radius + static_cast<double>(edgeReach);
    const QPoint lowest(
        below(std::min(from.x, to.x) - reach), below(std::min(from.y, to.y) - reach));
    const QPoint highest(
        below(std::max(from.x, to.x) + reach), below(std::max(from.y, to.y) + reach));
    return { lowest, highest };
}

void CoverageMask::reset(const QRect &area)
{
    m_area = area;
    m_coverage.assign(
        static_cast<std::size_t>(area.width()) * static_cast<std::size_t>(area.height()), 0);
}

std::uint8_t *CoverageMask::at(int x, int y)
{
    return m_coverage.data() + static_cast<std::ptrdiff_t>(y - m_area.y()) * m_area.width()
        + (x - m_area.x());
}

std::span<const std::uint8_t> CoverageMask::row(int x, int y, int width) const
{
    const auto start
        = static_cast<std::size_t>(y - m_area.y()) * static_cast<std::size_t>(m_area.width())
        + static_cast<std::size_t>(x - m_area.x());
    return std::span(m_coverage).subspan(start, static_cast<std::size_t>(width));
}

QRect CoverageMask::addCapsule(Point from, Point to, double radius)
{
    radius = std::min(radius, largestRadius);
    const QRect pixels = pixelsOfCapsule(from, to, radius);
    const QRect touched = pixels & m_area;
    if (touched.isEmpty())
        return pixels;
    if (to.x < from.x || (to.x == from.x && to.y < from.y))
        std::swap(from, to); // so that both directions of a line give the very same pixels
    constexpr double worthFilling = 4.0; // pixels; a thinner capsule wholly covers hardly any pixel
    const Capsule capsule(limited(from), limited(to), radius);
    for (int y = touched.y(); y <= touched.bottom(); ++y) {
        int first = touched.x();
        int last = touched.right() + 1;
        capsule.narrow(y, first, last);
        if (first >= last)
            continue;
        const auto cover = [&](int start, int end) {
            coverSpan(capsule, start, y, { at(start, y), static_cast<std::size_t>(end - start) });
        };
        int firstInside = first;
        int lastInside = last;
        if (radius >= worthFilling)
            capsule.findInside(y, firstInside, lastInside);
        if (radius < worthFilling || firstInside >= lastInside) {
            cover(first, last);
            continue;
        }
        cover(first, firstInside);
        std::fill(at(firstInside, y), at(lastInside, y), static_cast<std::uint8_t>(255));
        cover(lastInside, last);
    }
    return pixels;
}

void CoverageMask::clear(const QRect &part)
{
    for (int y = part.y(); y <= part.bottom(); ++y)
        std::fill_n(at(part.x(), y), part.width(), static_cast<std::uint8_t>(0));
}

} // namespace penwick
