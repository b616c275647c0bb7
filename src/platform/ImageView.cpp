// SPDX-License-Identifier: MIT
#include "platform/ImageView.h"

namespace penwick::platform {

ImageView::ImageView(QWidget *parent)
    : ViewOf(parent)
{ }

void ImageView::setImage(const QImage &image)
{
    m_image = image;
    setNeedsDisplay();
}

void ImageView::draw(const Rect &)
{
    if (m_image.isNull())
        return;
    QPainter painter(&surface());
    painter.drawImage(QPointF(0.0, height() - m_image.deviceIndependentSize().height()), m_image);
}

} // namespace penwick::platform
