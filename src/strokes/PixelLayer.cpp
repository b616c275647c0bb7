// SPDX-License-Identifier: MIT
#include "strokes/PixelLayer.h"

#include "strokes/CoverageMask.h"

#include <algorithm>

namespace penwick {

namespace {

/// Multiplies every channel of a premultiplied pixel by `share` / 255, and rounds. Two channels are
/// computed at once: every second one leaves the sixteen bits that a product needs.
inline std::uint32_t shareOf(std::uint32_t pixel, std::uint32_t share)
{
    constexpr std::uint32_t everySecond = 0x00ff00ff;
    constexpr std::uint32_t half = 0x00800080;
    const auto divided
        = [](std::uint32_t product) { return product + ((product >> 8) & everySecond) + half; };
    const std::uint32_t lower = divided((pixel & everySecond) * share) >> 8;
    const std::uint32_t upper = divided(((pixel >> 8) & everySecond) * share);
    return (lower & everySecond) | (upper & ~everySecond);
}

} // namespace

// On opaque paper no pixel is ever transparent. A format without alpha is then shown by plain
// copying, which is faster.
PixelLayer::PixelLayer(QSize size, const QColor &paper)
    : m_image(
        size, paper.alpha() == 255 ? QImage::Format_RGB32 : QImage::Format_ARGB32_Premultiplied)
    , m_paper(qPremultiply(paper.rgba()))
{
    m_image.fill(m_paper);
}

QRect PixelLayer::inImage(const QRect &area) const
{
    return { area.x(), m_image.height() - area.y() - area.height(), area.width(), area.height() };
}

std::span<std::uint32_t> PixelLayer::row(int x, int y, int width)
{
    auto *const line
        = reinterpret_cast<std::uint32_t *>(m_image.scanLine(m_image.height() - 1 - y));
    return { line + x, static_cast<std::size_t>(width) };
}

void PixelLayer::copy(const PixelLayer &other, const QRect &area)
{
    const QRect common = area & this->area() & other.area();
    for (int y = common.y(); y <= common.bottom(); ++y) {
        const auto *const source = reinterpret_cast<const std::uint32_t *>(
            other.m_image.constScanLine(other.m_image.height() - 1 - y));
        std::copy_n(
            source + common.x(), common.width(), row(common.x(), y, common.width()).begin());
    }
}

void PixelLayer::clear(const QRect &area)
{
    for (int y = area.y(); y <= area.bottom(); ++y)
        std::ranges::fill(row(area.x(), y, area.width()), m_paper);
}

void PixelLayer::blend(const CoverageMask &mask, const QColor &color, const QRect &area)
{
    constexpr std::uint32_t all = 255;
    const std::uint32_t ink = qPremultiply(color.rgba());
    for (int y = area.y(); y <= area.bottom(); ++y) {
        const auto pixels = row(area.x(), y, area.width());
        const auto coverage = mask.row(area.x(), y, area.width());
        for (std::size_t index = 0; index < pixels.size(); ++index) {
            if (coverage[index] == 0)
                continue;
            const std::uint32_t inked = shareOf(ink, coverage[index]);
            pixels[index] = inked + shareOf(pixels[index], all - (inked >> 24));
        }
    }
}

} // namespace penwick
