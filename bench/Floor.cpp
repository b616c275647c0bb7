// SPDX-License-Identifier: MIT
#include "Floor.h"

#include "Board.h"
#include "Pen.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

namespace penwick::bench {

namespace {

constexpr double radius = 2.5; // points

} // namespace

Floor::Floor()
{
    QWidget::resize(canvasWidth, canvasHeight);
    QWidget::show();
    settle();
    m_pixels = PixelLayer(size() * devicePixelRatioF());
    m_mask.reset(m_pixels.area());
}

void Floor::press(platform::Point point)
{
    sendPress(*this, point);
}

void Floor::drag(platform::Point point)
{
    sendDrag(*this, point);
}

platform::Point Floor::pixelAt(QPointF position) const
{
    const double scale = devicePixelRatioF();
    return { position.x() * scale, (height() - position.y()) * scale };
}

void Floor::mousePressEvent(QMouseEvent *event)
{
    m_from = pixelAt(event->position());
}

void Floor::mouseMoveEvent(QMouseEvent *event)
{
    const double scale = devicePixelRatioF();
    const platform::Point to = pixelAt(event->position());
    const QRect touched = m_mask.addCapsule(m_from, to, radius * scale) & m_mask.area();
    m_pixels.blend(m_mask, QColor(41, 41, 41, 178), touched);
    m_mask.clear(touched);
    m_from = to;
    const QRect inImage = m_pixels.inImage(touched);
    update(QRectF(
        inImage.x() / scale, inImage.y() / scale, inImage.width() / scale, inImage.height() / scale)
               .toAlignedRect());
}

void Floor::paintEvent(QPaintEvent *event)
{
    const double scale = devicePixelRatioF();
    const QRect area = event->rect();
    QPainter painter(this);
    painter.drawImage(QRectF(area), m_pixels.image(),
        QRectF(QPointF(area.topLeft()) * scale, QSizeF(area.size()) * scale));
}

} // namespace penwick::bench
