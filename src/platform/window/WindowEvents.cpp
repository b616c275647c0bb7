// SPDX-License-Identifier: MIT
// How a window handles the toolkit's events, those that no view has taken among them.
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/view/OwnLook.h"
#include "platform/window/WindowParts.h"

#include <QCloseEvent>
#include <QCoreApplication>
#include <QGuiApplication>
#include <QInputMethod>
#include <QPainter>

#include <utility>

namespace penwick::platform {

bool Window::event(QEvent *event)
{
    // An input method counts on the screen, and shows beside the caret what may be meant.
    if (event->type() == QEvent::Move && isActiveWindow())
        QGuiApplication::inputMethod()->update(Qt::ImCursorRectangle);
    const bool changesLook = isAboutLook(*event);
    const bool isHandled = QWidget::event(event);
    if (changesLook && keepOwnLook(*this)) // any other event may have destroyed the window
        setFrame(frame());
    return isHandled;
}

void Window::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::ActivationChange && std::exchange(d->isMain, isActiveWindow())
        && !isActiveWindow())
        tellDelegate(&WindowDelegate::windowDidResignMain);
    // Not every desktop minimises, with this window, a child that is on all virtual desktops.
    if (std::exchange(d->isMinimised, isMinimized()) != isMinimized() && isVisible())
        isMinimized() ? hideFamily() : showFamily();
}

// QWidget::close() would destroy the native window. When the window is shown again, a host that
// captures the screen would still leave out the old one.
bool Window::close()
{
    requireGuiThread();
    const QPointer<Window> closing = this; // a listener may destroy it
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
    WindowResponder *const responder = d->content.responder();
    if (responder && responder->keyDown(*event))
        event->accept();
    else
        QWidget::keyPressEvent(event);
}

void Window::mousePressEvent(QMouseEvent *event)
{
    event->accept();
    if (event->button() != Qt::LeftButton)
        return;
    d->glide->halt(); // the window stops where the user takes hold of it
    if (m_attributes.isMovable && m_attributes.isMovableByWindowBackground)
        d->drag.begin(frame(), event->globalPosition().toPoint());
    if (WindowResponder *const responder = d->content.responder())
        responder->mouseDown();
}

void Window::mouseMoveEvent(QMouseEvent *event)
{
    event->accept();
    if (!event->buttons().testFlag(Qt::LeftButton))
        return;
    if (const auto moved = d->drag.moved(frame(), event->globalPosition().toPoint()))
        setFrame(*moved);
}

void Window::mouseReleaseEvent(QMouseEvent *event)
{
    event->accept();
    if (event->button() != Qt::LeftButton)
        return;
    d->drag.end();
    if (WindowResponder *const responder = d->content.responder())
        responder->mouseUp();
}

void Window::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    d->content.place();
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
