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

/// A picture of a canvas, which begins at the canvas's bottom left corner. Where nothing has been
/// painted it shows the paper, which is a colour or transparent.
///
/// Coordinates are device pixels and rows are counted upwards, as in CoverageMask, so that a pixel
/// keeps its coordinates when the canvas is resized. The alpha is premultiplied.
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

    /// Copies the pixels of `area` from `other`, as far as `area` lies inside both layers.
    void copy(const PixelLayer &other, const QRect &area);
    /// Fills `area` with paper. `area` must lie inside the layer.
    void clear(const QRect &area);
    /// Lays `color` over each pixel of `area` in the measure in which `mask` covers it. `area` must
    /// lie inside both the layer and the mask.
    void blend(const CoverageMask &mask, const QColor &color, const QRect &area);

private:
    [[nodiscard]] std::span<std::uint32_t> row(int x, int y, int width);

    QImage m_image;
    std::uint32_t m_paper = 0;
};

} // namespace penwick
