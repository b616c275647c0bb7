// SPDX-License-Identifier: MIT
#include "platform/view/ImageView.h"

#include "platform/foundation/KeptShape.h"

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
    m_scaled = QImage();
    setNeedsDisplay();
}

void ImageView::setImageFrameStyle(ImageFrameStyle style)
{
    m_imageFrameStyle = style;
    setNeedsDisplay();
}

QRectF ImageView::imagePlace() const
{
    const QSizeF own = m_image.deviceIndependentSize();
    const Size size = scaledDownInto({ own.width(), own.height() }, bounds().size());
    return { 0.0, height() - size.height, size.width, size.height };
}

// The scaled image is kept, because each stroke over it has it painted again, and because a painter
// scales less well.
const QImage &ImageView::scaledTo(QSize pixels)
{
    if (m_scaled.size() != pixels)
        m_scaled = m_image.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    return m_scaled;
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
    if (m_image.isNull())
        return;
    const QRectF place = imagePlace();
    if (place.size() == m_image.deviceIndependentSize())
        painter.drawImage(place, m_image);
    else
        painter.drawImage(
            place, scaledTo((place.size() * painter.device()->devicePixelRatio()).toSize()));
}

} // namespace penwick::platform
