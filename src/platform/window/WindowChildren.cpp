// SPDX-License-Identifier: MIT
// What a window does together with those that stand above it.
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/window/WindowParts.h"

#include <QWindow>

namespace penwick::platform {

void Window::expectChildWindow(Window &child)
{
    requireGuiThread();
    d->captures.add(child.d->captures);
}

void Window::addChildWindow(Window &child)
{
    requireGuiThread();
    if (child.parentWindow() != this) {
        d->family.add(child.d->family);
        d->captures.add(child.d->captures);
    }
    if (child.canShow())
        child.orderFront();
}

void Window::removeChildWindow(Window &child)
{
    requireGuiThread();
    d->captures.remove(child.d->captures);
    if (child.parentWindow() != this)
        return;
    child.d->family.leaveParent();
    if (!child.isVisible())
        child.d->family.setOrderedIn(
            false); // it went with its parent, and does not come back with it
    if (child.windowHandle())
        child.windowHandle()->setTransientParent(nullptr);
}

Window *Window::parentWindow() const
{
    requireGuiThread();
    return d->family.parent();
}

std::vector<Window *> Window::childWindows() const
{
    requireGuiThread();
    return d->family.children();
}

// Whether the parent, if there is one, is on the screen.
bool Window::canShow() const
{
    const Window *const parent = d->family.parent();
    return !parent || (parent->isVisible() && !parent->isMinimized());
}

void Window::showFamily()
{
    for (Window *const child : childWindows()) {
        if (!child->d->family.isOrderedIn() || child->isVisible())
            continue;
        // Some desktops have minimised the child together with this window before it was hidden.
        child->setWindowState(child->windowState() & ~Qt::WindowMinimized);
        child->show();
    }
}

void Window::hideFamily()
{
    for (Window *const child : childWindows()) {
        const bool comesBack = child->d->family.isOrderedIn();
        child->hide();
        child->d->family.setOrderedIn(comesBack);
    }
}

// Brings the windows above this one to the front again, after it was brought there itself. A window
// manager keeps this order by itself; where there is none, nobody else does.
void Window::raiseFamily()
{
    for (Window *const child : childWindows()) {
        if (!child->isVisible())
            continue;
        child->raise();
        child->raiseFamily();
    }
}

// `delta` is of Qt's desktop.
void Window::takeFamilyAlong(QPoint delta) const
{
    for (Window *const child : childWindows()) {
        const Point origin = child->frame().origin();
        child->setFrameOrigin({ origin.x + delta.x(), origin.y - delta.y() });
    }
}

} // namespace penwick::platform
