// SPDX-License-Identifier: MIT
// What a window makes of the toolkit's events, and of those that no view has taken.
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/view/OwnLook.h"
#include "platform/view/View.h"
#include "platform/window/WindowPrivate.h"

#include <QCloseEvent>
#include <QCoreApplication>
#include <QPainter>

#include <utility>

namespace penwick::platform {

bool Window::event(QEvent *event)
{
    const bool changesLook = isAboutLook(*event);
    const bool isHandled = QWidget::event(event);
    if (changesLook && keepOwnLook(*this)) // other events may have been the window's last
        setFrame(frame());
    return isHandled;
}

void Window::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::ActivationChange && std::exchange(d->isMain, isActiveWindow())
        && !isActiveWindow())
        tellDelegate(&WindowDelegate::windowDidResignMain);
    // Not every desktop takes along what is on all its virtual desktops.
    if (std::exchange(d->isMinimised, isMinimized()) != isMinimized() && isVisible())
        isMinimized() ? hideFamily() : showFamily();
}

// Not the toolkit's: that lets go of the native window, and whoever captures the screen would leave
// out one that is gone when the window is shown again.
bool Window::close()
{
    requireGuiThread();
    const QPointer<Window> closing = this; // whoever is told may end it
    QCloseEvent event;
    QCoreApplication::sendEvent(this, &event);
    if (closing)
        hide();
    return true;
}

void Window::closeEvent(QCloseEvent *event)
{
    requireGuiThread();
    event->accept();
    if (!std::exchange(d->isClosed, true))
        tellDelegate(&WindowDelegate::windowWillClose);
}

// Whatever no view has taken

void Window::keyPressEvent(QKeyEvent *event)
{
    if (d->windowController && d->windowController->keyDown(*event))
        event->accept();
    else
        QWidget::keyPressEvent(event);
}

void Window::mousePressEvent(QMouseEvent *event)
{
    event->accept();
    if (event->button() != Qt::LeftButton)
        return;
    d->glide->halt(); // where the user sees it is where it is taken hold of
    d->drag.begin(*this, event->globalPosition().toPoint());
    if (d->windowController)
        d->windowController->mouseDown();
}

void Window::mouseMoveEvent(QMouseEvent *event)
{
    event->accept();
    if (event->buttons().testFlag(Qt::LeftButton))
        d->drag.goOn(*this, event->globalPosition().toPoint());
}

void Window::mouseReleaseEvent(QMouseEvent *event)
{
    event->accept();
    if (event->button() != Qt::LeftButton)
        return;
    d->drag.end();
    if (d->windowController)
        d->windowController->mouseUp();
}

void Window::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    for (View *const view : topViews()) {
        if (view == m_contentView)
            setContentView(view);
        else
            view->place();
    }
}

void Window::paintEvent(QPaintEvent *event)
{
    QPainter painter(this);
    if (d->backdrop.paint(painter))
        return;
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.fillRect(event->rect(), m_attributes.backgroundColor);
}

} // namespace penwick::platform
