// SPDX-License-Identifier: MIT
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/native/NativeDesktop.h"
#include "platform/view/View.h"
#include "platform/window/WindowFlags.h"
#include "platform/window/WindowPrivate.h"

#include <QWindow>

#include <utility>

namespace penwick::platform {

namespace {

// Checks before QWidget's constructor does, which would end the process with a line of the
// toolkit's.
QWidget *checked(QWidget *parent)
{
    requireApplication();
    return parent;
}

} // namespace

WindowDelegate::~WindowDelegate() = default;

Window::Window(QWidget *parent)
    : QWidget(checked(parent), Qt::Window)
    , d(std::make_unique<Private>(*this))
{
    setAttribute(Qt::WA_QuitOnClose, false);
    setAttribute(Qt::WA_AlwaysShowToolTips); // a panel is never the active window
    const FrameTracker *const tracker = d->tracker;
    connect(tracker, &FrameTracker::rescaled, this, [this] { WindowBackdrop::rescale(*this); });
    connect(tracker, &FrameTracker::shifted, this, [this](QPoint by) { d->family.takeAlong(by); });
    const auto tell = [this](auto signal, void (WindowDelegate::*what)()) {
        connect(d->tracker, signal, this, [this, what] { tellDelegate(what); });
    };
    tell(&FrameTracker::moveBegan, &WindowDelegate::windowWillMove);
    tell(&FrameTracker::moved, &WindowDelegate::windowDidMove);
    tell(&FrameTracker::resized, &WindowDelegate::windowDidResize);
    connect(tracker, &FrameTracker::settled, this, &Window::frameSettled);
    applyAttributes();
}

Window::Window(const Rect &contentRect, StyleMasks styleMask, BackingStore, bool)
    : Window()
{
    WindowAttributes attributes;
    attributes.styleMask = styleMask;
    setAttributes(attributes);
    setFrame(contentRect);
}

Window::~Window()
{
    requireGuiThreadAtEnd();
    // A view that is destroyed together with its window does not resign.
    m_firstResponder = nullptr;
    for (Window *const child : childWindows())
        child->hide();
    releaseContentView();
}

// Frame

Rect Window::frame() const
{
    requireGuiThread();
    return d->tracker->frame();
}

void Window::setFrame(const Rect &frame, Animate animate)
{
    requireGuiThread();
    const bool isElsewhere = d->glide->isUnderWay() || !(frame == d->tracker->frame());
    if (animate == Animate::Yes && isVisible() && isElsewhere)
        return d->glide->start(frame);
    d->glide->stop();
    d->tracker->request(frame);
}

void Window::setFrameOrigin(Point origin)
{
    requireGuiThread();
    setFrame({ origin.x, origin.y, frame().width, frame().height });
}

// Attributes

const WindowAttributes &Window::attributes() const
{
    requireGuiThread();
    return m_attributes;
}

void Window::setAttributes(const WindowAttributes &attributes)
{
    requireGuiThread();
    if (attributes == m_attributes)
        return;
    m_attributes = attributes;
    applyAttributes();
    d->captures.check();
}

void Window::applyAttributes()
{
    setAttribute(Qt::WA_TranslucentBackground, !m_attributes.isOpaque);
    setAttribute(Qt::WA_ShowWithoutActivating, !canBecomeKey(m_attributes));
    const Qt::WindowFlags flags = windowFlagsFor(m_attributes);
    if (flags != windowFlags()) {
        const bool wasVisible = isVisible(); // new flags take a window off the screen
        setWindowFlags(flags);
        if (wasVisible)
            show();
    }
    update();
    if (m_contentView) // it may show the background itself
        m_contentView->setNeedsDisplay();
}

// Content

View *Window::contentView() const
{
    requireGuiThread();
    return m_contentView;
}

void Window::setContentView(View *view)
{
    requireGuiThread();
    if (view != m_contentView)
        releaseContentView();
    m_contentView = view;
    if (!view)
        return;
    if (view->widget().parentWidget() != this) {
        d->isContentBorrowed = true;
        view->widget().setParent(this);
        view->announceWindow();
        view->widget().show();
    }
    view->setFrame({ 0.0, 0.0, static_cast<double>(width()), static_cast<double>(height()) });
}

void Window::releaseContentView()
{
    if (!m_contentView || !std::exchange(d->isContentBorrowed, false))
        return;
    m_contentView->widget().hide();
    m_contentView->widget().setParent(nullptr);
    m_contentView = nullptr;
}

ViewController *Window::contentViewController() const
{
    requireGuiThread();
    return d->contentViewController.get();
}

void Window::setContentViewController(std::unique_ptr<ViewController> controller)
{
    requireGuiThread();
    d->contentViewController = std::move(controller);
    if (d->contentViewController) {
        d->contentViewController->setParent(this); // so that findChild() finds it
        setContentView(d->contentViewController->view());
    }
}

WindowController *Window::windowController() const
{
    requireGuiThread();
    return d->windowController;
}

void Window::setWindowController(WindowController *controller)
{
    requireGuiThread();
    d->windowController = controller;
}

void Window::tellDelegate(void (WindowDelegate::*what)())
{
    if (WindowDelegate *const told = delegate())
        (told->*what)();
}

WindowDelegate *Window::delegate() const
{
    requireGuiThread();
    return m_delegateObject ? m_delegate : nullptr;
}

void Window::setDelegate(WindowDelegate *delegate)
{
    requireGuiThread();
    m_delegateObject = dynamic_cast<QObject *>(delegate);
    m_delegate = delegate;
}

void Window::adoptScene()
{
    requireGuiThread();
    d->tracker->request({ 0.0, 0.0, static_cast<double>(width()), static_cast<double>(height()) });
    for (View *const view : topViews()) {
        view->adoptScene();
        view->announceWindow();
    }
}

std::vector<View *> Window::topViews() const
{
    std::vector<View *> views;
    for (QObject *const child : children()) {
        if (auto *const view = dynamic_cast<View *>(child))
            views.push_back(view);
    }
    return views;
}

// Responders

View *Window::firstResponder() const
{
    requireGuiThread();
    return m_firstResponder;
}

bool Window::isKeyWindow() const
{
    requireGuiThread();
    return isActiveWindow();
}

bool Window::makeFirstResponder(View *view)
{
    requireGuiThread();
    if (view != m_firstResponder) {
        View *const previous = m_firstResponder;
        // There is no first responder while the previous one resigns, because it may remove itself
        // from the window.
        m_firstResponder = nullptr;
        if (previous && !previous->resignFirstResponder()) {
            m_firstResponder = previous;
            return false;
        }
        // The previous one may have made another view first responder. That one stays, if no other
        // is wanted.
        if (view || !m_firstResponder)
            m_firstResponder = view && view->window() == &d->content ? view : nullptr;
    }
    QWidget &receiver = m_firstResponder ? m_firstResponder->widget() : *this;
    receiver.setFocus(Qt::OtherFocusReason);
    return m_firstResponder == view;
}

void Window::forgetView(const View &view)
{
    requireGuiThread();
    if (m_firstResponder == &view)
        m_firstResponder = nullptr;
    if (m_contentView == &view)
        m_contentView = nullptr;
}

void Window::invalidateCursorRects(View &view)
{
    requireGuiThread();
    view.refreshCursorRects();
}

// Child windows

void Window::addChildWindow(Window &child)
{
    requireGuiThread();
    if (child.parentWindow() != this) {
        if (Window *const former = child.parentWindow())
            former->d->family.remove(child);
        child.d->family.setParent(this);
        d->family.add(child);
        d->captures.add(child.d->captures);
    }
    if (child.d->family.canShow())
        child.orderFront();
}

void Window::removeChildWindow(Window &child)
{
    requireGuiThread();
    d->captures.remove(child.d->captures);
    if (child.parentWindow() != this)
        return;
    d->family.remove(child);
    child.d->family.setParent(nullptr);
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

// Showing and closing

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

void Window::orderFront()
{
    requireGuiThread();
    show();
    raise();
    raiseChildrenOf(*this);
}

void Window::orderOut()
{
    requireGuiThread();
    hide();
}

void Window::orderIn()
{
    if (d->family.isOrderedIn())
        return;
    d->family.setOrderedIn(true);
    d->isClosed = false;
    if (d->contentViewController)
        d->contentViewController->viewWillAppear();
    tellDelegate(&WindowDelegate::windowWillAppear);
}

void Window::setVisible(bool visible)
{
    requireGuiThread();
    if (visible)
        orderIn();
    else
        d->family.setOrderedIn(false);
    if (visible && !d->family.canShow())
        return;
    if (visible && !isVisible()) {
        d->backdrop.prepare(*this);
        d->tracker->prepareToShow();
        // Only the native windows are joined. A widget's child would be destroyed with its parent,
        // but a window may outlive the one that it stands above.
        windowHandle()->setTransientParent(
            parentWindow() ? parentWindow()->windowHandle() : nullptr);
    }
    QWidget::setVisible(visible);
    if (!visible)
        return hideFamily();
    NativeDesktop::instance().applyAttributes(*windowHandle(), m_attributes);
    showFamily();
}

} // namespace penwick::platform
