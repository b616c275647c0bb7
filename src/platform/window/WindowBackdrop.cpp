// SPDX-License-Identifier: MIT
#include "platform/window/WindowBackdrop.h"

#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/native/NativeDesktop.h"
#include "platform/view/View.h"
#include "platform/window/ScreenCoordinates.h"
#include "platform/window/WindowFlags.h"

#include <QBitmap>
#include <QGuiApplication>
#include <QLoggingCategory>
#include <QPainter>
#include <QScreen>
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

bool Window::showsWhatIsBelow() const
{
    requireGuiThread();
    return attributes().isOpaque || NativeDesktop::instance().isCompositing();
}

void WindowBackdrop::prepare(Window &window)
{
    m_picture = QPixmap();
    window.clearMask();
    if (window.showsWhatIsBelow())
        return;
    const QRect area = toDesktop(window.frame());
    if (canBecomeKey(window.attributes())) {
        m_picture = pictureOf(area);
        qCInfo(desktopLog,
            "no compositing manager: a transparent layer shows a picture of what "
            "was below it when it opened");
    } else if (window.contentView() && window.contentView()->layer()) {
        window.setMask(rounded(area.size(), window.contentView()->layer()->cornerRadius));
    }
}

// The toolkit keeps the shape in the pixels of the scale that it was set with.
void WindowBackdrop::rescale(Window &window)
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
