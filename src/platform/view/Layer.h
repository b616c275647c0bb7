// SPDX-License-Identifier: MIT
// The backing of a view: what is painted under and around its content.
#pragma once

#include <QColor>
#include <QRectF>

class QPainter;

namespace penwick::platform {

/// Colours and border of a view that asked for a layer. The border lies inside the view's bounds,
/// over its content.
struct Layer
{
    QColor backgroundColor = Qt::transparent;
    QColor borderColor = Qt::black;
    double borderWidth = 0.0; ///< points
    double cornerRadius = 0.0; ///< points; rounds the background and the border

    [[nodiscard]] bool hasBackground() const { return backgroundColor.alpha() > 0; }
    /// Whether anything of the border along the inside of `bounds` lies in `part` of them.
    [[nodiscard]] bool hasBorderIn(const QRectF &part, const QRectF &bounds) const;
    /// Fills `bounds`, in the painter's own coordinates, with the background.
    void paintBackground(QPainter &painter, const QRectF &bounds) const;
    /// Draws the border along the inside of `bounds`.
    void paintBorder(QPainter &painter, const QRectF &bounds) const;
};

} // namespace penwick::platform
