// SPDX-License-Identifier: MIT
// Painted pixels of a canvas.
#pragma once

#include <QColor>
#include <QImage>
#include <QRect>

#include <cstdint>
#include <span>

namespace penwick {

class CoverageMask;

/// A picture of part of a canvas, from the canvas's bottom left corner on. What nothing was painted
/// on shows the paper: a colour, or nothing.
///
/// Coordinates are device pixels and rows are counted upwards, as in CoverageMask, so that a pixel
/// stays the same pixel however the canvas is resized. The alpha is premultiplied.
class PixelLayer
{
public:
    PixelLayer() = default;
    explicit PixelLayer(QSize size, const QColor &paper = Qt::transparent);

    [[nodiscard]] QRect area() const { return { QPoint(), m_image.size() }; }
    /// The picture as it stands; its first line is the highest row.
    [[nodiscard]] const QImage &image() const { return m_image; }
    /// The part of image() that shows `area`.
    [[nodiscard]] QRect inImage(const QRect &area) const;

    /// Takes the pixels of `area` from `other`; of what lies outside of either, nothing.
    void copy(const PixelLayer &other, const QRect &area);
    /// Leaves nothing but paper in `area`, which lies inside.
    void clear(const QRect &area);
    /// Lays `color` over the pixels of `area`, which lies inside both, as far as `mask` covers
    /// them.
    void blend(const CoverageMask &mask, const QColor &color, const QRect &area);

private:
    [[nodiscard]] std::span<std::uint32_t> row(int x, int y, int width);

    QImage m_image;
    std::uint32_t m_paper = 0;
};

} // namespace penwick
