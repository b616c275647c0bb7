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

QRectF ImageView::imagePlace() const
{
    const QSizeF size = m_image.deviceIndependentSize();
    return { QPointF(0.0, height() - size.height()), size };
}

void ImageView::draw(const Rect &)
{
    if (m_image.isNull())
        return;
    QPainter painter(&surface());
    drawContent(painter);
    if (m_imageFrameStyle == ImageFrameStyle::Photo) {
        painter.setPen(QPen(photoFrame, 1.0, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
        painter.drawRect(imagePlace().adjusted(0.5, 0.5, -0.5, -0.5));
    }
}

void ImageView::drawContent(QPainter &painter)
{
    if (!m_image.isNull())
        painter.drawImage(imagePlace(), m_image);
}

} // namespace penwick::platform
