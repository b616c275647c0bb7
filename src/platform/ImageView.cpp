// SPDX-License-Identifier: MIT
#include "platform/ImageView.h"

namespace penwick::platform {

namespace {

constexpr QColor photoFrame { 128, 128, 128 };

} // namespace

ImageView::ImageView(QWidget *parent)
    : ViewOf(parent)
{ }

void ImageView::setImage(const QImage &image)
{
    m_image = image;
    setNeedsDisplay();
}

void ImageView::setImageFrameStyle(ImageFrameStyle style)
{
    m_imageFrameStyle = style;
    setNeedsDisplay();
}

void ImageView::draw(const Rect &)
{
    if (m_image.isNull())
        return;
    QPainter painter(&surface());
    const QSizeF size = m_image.deviceIndependentSize();
    const QRectF place(QPointF(0.0, height() - size.height()), size);
    painter.drawImage(place, m_image);
    if (m_imageFrameStyle == ImageFrameStyle::Photo) {
        painter.setPen(QPen(photoFrame, 1.0, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
        painter.drawRect(place.adjusted(0.5, 0.5, -0.5, -0.5));
    }
}

} // namespace penwick::platform
