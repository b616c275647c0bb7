// SPDX-License-Identifier: MIT
#include "platform/window/WindowBackdrop.h"

#include <QBitmap>
#include <QGuiApplication>
#include <QLoggingCategory>
#include <QPainter>
#include <QScreen>
#include <QWidget>
#include <QWindow>

namespace penwick::platform {

namespace {

Q_LOGGING_CATEGORY(desktopLog, "penwick.desktop", QtInfoMsg)

QRegion rounded(QSize size, double radius)
{
    QBitmap shape(size);
    shape.fill(Qt::color0);
    QPainter painter(&shape);
    painter.setBrush(Qt::color1);
    painter.setPen(Qt::NoPen);
    painter.drawRoundedRect(QRectF(QPointF(), QSizeF(size)), radius, radius);
    painter.end();
    return QRegion(shape);
}

QPixmap pictureOf(const QRect &area)
{
    QScreen *screen = QGuiApplication::screenAt(area.center());
    if (!screen)
        screen = QGuiApplication::primaryScreen();
    const QPoint inScreen = area.topLeft() - screen->geometry().topLeft();
    return screen->grabWindow(0, inScreen.x(), inScreen.y(), area.width(), area.height());
}

} // namespace

void WindowBackdrop::clear(QWidget &window)
{
    m_picture = QPixmap();
    window.clearMask();
}

void WindowBackdrop::takePicture(const QRect &area)
{
    m_picture = pictureOf(area);
    qCInfo(desktopLog,
        "no compositing manager: a transparent layer shows a picture of what "
        "was below it when it opened");
}

void WindowBackdrop::cutCorners(QWidget &window, QSize size, double radius)
{
    window.setMask(rounded(size, radius));
}

// The toolkit keeps the shape in the pixels of the scale that it was set with, so it is given the
// shape again.
void WindowBackdrop::rescale(QWidget &window)
{
    if (!window.mask().isEmpty())
        window.windowHandle()->setMask(window.mask());
}

bool WindowBackdrop::paint(QPainter &painter) const
{
    if (m_picture.isNull())
        return false;
    painter.drawPixmap(QPointF(), m_picture);
    return true;
}

} // namespace penwick::platform
