// SPDX-License-Identifier: MIT
#include "platform/view/Layer.h"

#include <QPainter>

#include <algorithm>

namespace penwick::platform {

bool Layer::hasBorderIn(const QRectF &part, const QRectF &bounds) const
{
    if (borderWidth <= 0.0 || borderColor.alpha() == 0)
        return false;
    constexpr double softEdge = 1.0; // points
    const double depth = std::max(borderWidth, cornerRadius) + softEdge;
    const QRectF inside = bounds.adjusted(depth, depth, -depth, -depth);
    return !inside.isValid() || !inside.contains(part);
}

void Layer::paintBackground(QPainter &painter, const QRectF &bounds) const
{
    if (!hasBackground())
        return;
    painter.setRenderHint(QPainter::Antialiasing, cornerRadius > 0.0);
    painter.setPen(Qt::NoPen);
    painter.setBrush(backgroundColor);
    painter.drawRoundedRect(bounds, cornerRadius, cornerRadius);
}

void Layer::paintBorder(QPainter &painter, const QRectF &bounds) const
{
    if (!hasBorderIn(bounds, bounds))
        return;
    const double inset = borderWidth / 2;
    const double radius = cornerRadius > inset ? cornerRadius - inset : 0.0;
    // Smooth edges change a square border only where its edges do not lie between two pixels.
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(borderColor, borderWidth, Qt::SolidLine, Qt::SquareCap,
        radius > 0.0 ? Qt::RoundJoin : Qt::MiterJoin));
    painter.setBrush(Qt::NoBrush);
    painter.drawRoundedRect(bounds.adjusted(inset, inset, -inset, -inset), radius, radius);
}

} // namespace penwick::platform
