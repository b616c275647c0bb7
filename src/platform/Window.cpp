// SPDX-License-Identifier: MIT
#include <penwick/platform/Window.h>

#include <penwick/platform/WindowController.h>

#include "platform/FrameTracker.h"
#include "platform/View.h"
#include "platform/ViewController.h"
#include "platform/WindowFlags.h"

#include <QCloseEvent>
#include <QPainter>
#include <QVariantAnimation>
#include <QWindow>

namespace penwick::platform {

namespace {

constexpr int glideTime = 200; // ms

Rect between(const Rect &from, const Rect &to, double progress)
{
    const auto mix = [progress](double a, double b) { return a + (b - a) * progress; };
    return { mix(from.x, to.x), mix(from.y, to.y), mix(from.width, to.width),
        mix(from.height, to.height) };
}

} // namespace

WindowDelegate::~WindowDelegate() = default;

class Window::Private
{
public:
    explicit Private(Window &window)
        : tracker(new FrameTracker(window))
    { }

    FrameTracker *const tracker; // a child of the window
    std::optional<Rect> glideTarget;
    QPointer<QVariantAnimation> glide;
    std::unique_ptr<ViewController> contentViewController;
    QPointer<WindowController> windowController;
    QPointer<Window> parentWindow;
    std::vector<QPointer<Window>> childWindows;
    bool isOrderedIn = false; // on the screen, or will be as soon as its parent is
    bool isClosed = false;
};

Window::Window(QWidget *parent)
    : QWidget(parent, Qt::Window)
    , d(std::make_unique<Private>(*this))
{
    setAttribute(Qt::WA_QuitOnClose, false);
    connect(d->tracker, &FrameTracker::shifted, this, &Window::takeChildrenAlong);
    connect(d->tracker, &FrameTracker::moved, this, [this] {
        if (m_delegateObject)
            m_delegate->windowDidMove();
    });
    applyAttributes();
}

Window::~Window()
{
    // A view that goes down with the window has nobody left to resign to.
    m_firstResponder = nullptr;
    for (Window *const child : childWindows())
        child->hide();
}

// Frame

Rect Window::frame() const
{
    return d->glideTarget ? *d->glideTarget : d->tracker->frame();
}

void Window::setFrame(const Rect &frame, Animate animate)
{
    delete d->glide;
    d->glideTarget.reset();
    if (animate == Animate::No || !isVisible() || frame == d->tracker->frame()) {
        d->tracker->request(frame);
        return;
    }
    const Rect start = d->tracker->frame();
    d->glideTarget = frame;
    d->glide = new QVariantAnimation(this);
    d->glide->setDuration(glideTime);
    d->glide->setEasingCurve(QEasingCurve::OutCubic);
    d->glide->setStartValue(0.0);
    d->glide->setEndValue(1.0);
    connect(d->glide, &QVariantAnimation::valueChanged, this, [this, start](const QVariant &value) {
        d->tracker->request(between(start, *d->glideTarget, value.toDouble()));
    });
    connect(d->glide, &QVariantAnimation::finished, this, [this] { d->glideTarget.reset(); });
    d->glide->start(QAbstractAnimation::DeleteWhenStopped);
}

void Window::setFrameOrigin(Point origin)
{
    const Rect now = frame();
    setFrame({ origin.x, origin.y, now.width, now.height });
}

// Attributes

void Window::setAttributes(const WindowAttributes &attributes)
{
    if (attributes == m_attributes)
        return;
    m_attributes = attributes;
    applyAttributes();
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
}

// Content

void Window::setContentView(View *view)
{
    m_contentView = view;
    if (view)
        view->setFrame({ 0.0, 0.0, static_cast<double>(width()), static_cast<double>(height()) });
}

ViewController *Window::contentViewController() const
{
    return d->contentViewController.get();
}

void Window::setContentViewController(std::unique_ptr<ViewController> controller)
{
    d->contentViewController = std::move(controller);
    if (d->contentViewController) {
        d->contentViewController->setParent(this); // found by introspection
        setContentView(d->contentViewController->view());
    }
}

WindowController *Window::windowController() const
{
    return d->windowController;
}

void Window::setWindowController(WindowController *controller)
{
    d->windowController = controller;
}

void Window::setDelegate(WindowDelegate *delegate)
{
    m_delegateObject = dynamic_cast<QObject *>(delegate);
    m_delegate = delegate;
}

void Window::adoptScene()
{
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

bool Window::makeFirstResponder(View *view)
{
    if (view != m_firstResponder) {
        View *const previous = m_firstResponder;
        // Nobody is, while it resigns: it may take itself out of the window as it does.
        m_firstResponder = nullptr;
        if (previous && !previous->resignFirstResponder()) {
            m_firstResponder = previous;
            return false;
        }
        m_firstResponder = view && view->window() == this ? view : nullptr;
    }
    QWidget &receiver = m_firstResponder ? m_firstResponder->widget() : *this;
    receiver.setFocus(Qt::OtherFocusReason);
    return m_firstResponder == view;
}

void Window::forgetView(const View &view)
{
    if (m_firstResponder == &view)
        m_firstResponder = nullptr;
    if (m_contentView == &view)
        m_contentView = nullptr;
}

void Window::invalidateCursorRects(View &view)
{
    view.refreshCursorRects();
}

// Child windows

void Window::addChildWindow(Window &child)
{
    if (child.d->parentWindow != this) {
        if (Window *const former = child.d->parentWindow)
            std::erase(former->d->childWindows, &child);
        child.d->parentWindow = this;
        d->childWindows.emplace_back(&child);
    }
    child.orderFront();
}

Window *Window::parentWindow() const
{
    return d->parentWindow;
}

std::vector<Window *> Window::childWindows() const
{
    std::vector<Window *> children;
    for (const auto &child : d->childWindows) {
        if (child)
            children.push_back(child);
    }
    return children;
}

void Window::takeChildrenAlong(QPoint delta)
{
    for (Window *const child : childWindows()) {
        const Point origin = child->frame().origin();
        child->setFrameOrigin({ origin.x + delta.x(), origin.y - delta.y() });
    }
}

// Showing and closing

bool Window::canShow() const
{
    const Window *const parent = d->parentWindow;
    return !parent || (parent->isVisible() && !parent->isMinimized());
}

void Window::showFamily()
{
    for (Window *const child : childWindows()) {
        if (child->d->isOrderedIn && !child->isVisible())
            child->show();
    }
}

void Window::hideFamily()
{
    for (Window *const child : childWindows()) {
        const bool comesBack = child->d->isOrderedIn;
        child->hide();
        child->d->isOrderedIn = comesBack;
    }
}

void Window::orderFront()
{
    show();
    raise();
}

void Window::orderOut()
{
    hide();
}

void Window::setVisible(bool visible)
{
    d->isOrderedIn = visible;
    if (visible && !canShow())
        return;
    if (visible && !isVisible()) {
        d->isClosed = false;
        d->tracker->prepareToShow();
        // Not a widget's child: a window outlives the one it stands above.
        windowHandle()->setTransientParent(
            d->parentWindow ? d->parentWindow->windowHandle() : nullptr);
    }
    QWidget::setVisible(visible);
    if (visible)
        showFamily();
    else
        hideFamily();
}

void Window::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() != QEvent::WindowStateChange)
        return;
    if (isMinimized())
        hideFamily();
    else
        showFamily();
}

void Window::closeEvent(QCloseEvent *event)
{
    event->accept();
    if (d->isClosed)
        return;
    d->isClosed = true;
    if (m_delegateObject)
        m_delegate->windowWillClose();
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
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.fillRect(event->rect(), m_attributes.backgroundColor);
}

} // namespace penwick::platform
