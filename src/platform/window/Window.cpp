// SPDX-License-Identifier: MIT
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/native/NativeDesktop.h"
#include "platform/view/View.h"
#include "platform/view/ViewController.h"
#include "platform/window/ScreenCoordinates.h"
#include "platform/window/WindowFlags.h"
#include "platform/window/WindowParts.h"

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

bool isLeftOut(const WindowAttributes &attributes)
{
    return attributes.sharingType == SharingType::none;
}

// The shape that a window keeps while its user resizes it, if it does and can be resized at all.
std::optional<Size> keptRatio(const WindowAttributes &attributes)
{
    const bool isResizable = attributes.styleMask.testFlag(StyleMask::resizable);
    return isResizable ? attributes.aspectRatio : std::nullopt;
}

// The nearest of the windows below `window` that may have the keys; null if there is none.
Window *keyWindowBelow(const Window &window)
{
    Window *below = window.parentWindow();
    while (below && !canBecomeKey(below->attributes()))
        below = below->parentWindow();
    return below;
}

} // namespace

WindowDelegate::~WindowDelegate() = default;

Window::Window(QWidget *parent)
    : QWidget(checked(parent), Qt::Window)
    , d(std::make_unique<WindowParts>(*this, *this))
{
    setAttribute(Qt::WA_QuitOnClose, false);
    setAttribute(Qt::WA_AlwaysShowToolTips); // a panel is never the active window
    const FrameTracker *const tracker = d->tracker;
    connect(tracker, &FrameTracker::rescaled, this, [this] { WindowBackdrop::rescale(*this); });
    connect(tracker, &FrameTracker::shifted, this, [this](QPoint by) { takeFamilyAlong(by); });
    const auto tell = [this](auto signal, void (WindowDelegate::*what)()) {
        connect(d->tracker, signal, this, [this, what] { tellDelegate(what); });
    };
    tell(&FrameTracker::moveBegan, &WindowDelegate::windowWillMove);
    tell(&FrameTracker::moved, &WindowDelegate::windowDidMove);
    tell(&FrameTracker::resized, &WindowDelegate::windowDidResize);
    connect(tracker, &FrameTracker::settled, this, &Window::frameSettled);
    connect(
        d->shape, &WindowShape::corrected, this, [this](const Rect &frame) { setFrame(frame); });
    connect(&d->layerCall, &LayerCall::called, this, [this] {
        if (Window *const layer = keyWindowBelow(*this)) {
            layer->orderFront();
            layer->activateWindow();
        }
    });
    connect(&d->captures, &CaptureExclusion::changed, this,
        &Window::windowsToLeaveOutOfCapturesChanged);
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
    d->content.end();
    for (Window *const child : childWindows())
        child->hide();
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
    d->captures.setLeftOut(isLeftOut(m_attributes));
    d->shape->setRatio(keptRatio(m_attributes));
    d->shape->setResizable(m_attributes.styleMask.testFlag(StyleMask::resizable));
    d->content.setBackgroundColor(m_attributes.backgroundColor);
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

void Window::standAmongOthers()
{
    const Window *const below = keyWindowBelow(*this);
    const WindowStanding standing
        = standingOf(m_attributes, below ? &below->m_attributes : nullptr);
    NativeDesktop::instance().prepareToShow(*windowHandle(), standing);
    d->layerCall.listen(standing.isUnmanaged ? windowHandle() : nullptr);
}

bool Window::showsWhatIsBelow() const
{
    requireGuiThread();
    return m_attributes.isOpaque || NativeDesktop::instance().isCompositing();
}

void Window::prepareBackdrop()
{
    d->backdrop.clear(*this);
    if (showsWhatIsBelow())
        return;
    const QRect area = toDesktop(frame());
    View *const content = d->content.contentView();
    if (canBecomeKey(m_attributes))
        d->backdrop.takePicture(area);
    else if (content && content->layer())
        WindowBackdrop::cutCorners(*this, area.size(), content->layer()->cornerRadius);
}

// Captures

bool Window::isKeptOutOfCaptures() const
{
    requireGuiThread();
    return isLeftOut(m_attributes) && NativeDesktop::instance().keepsWindowsOutOfCaptures();
}

std::vector<WId> Window::windowsToLeaveOutOfCaptures() const
{
    requireGuiThread();
    return d->captures.identifiers();
}

// Delegate

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

// Showing and closing

void Window::orderFront()
{
    requireGuiThread();
    show();
    raise();
    raiseFamily();
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
    if (ViewController *const controller = d->content.contentViewController())
        controller->viewWillAppear();
    tellDelegate(&WindowDelegate::windowWillAppear);
}

void Window::setVisible(bool visible)
{
    requireGuiThread();
    if (visible)
        orderIn();
    else
        d->family.setOrderedIn(false);
    if (visible && !canShow())
        return;
    if (visible && !isVisible()) {
        d->glide->stop(); // one of an earlier showing would go on
        prepareBackdrop();
        d->tracker->prepareToShow();
        // Only the native windows are joined. A widget's child would be destroyed with its parent,
        // but a window may outlive the one that it stands above.
        windowHandle()->setTransientParent(
            parentWindow() ? parentWindow()->windowHandle() : nullptr);
        standAmongOthers();
    }
    QWidget::setVisible(visible);
    if (!visible)
        return hideFamily();
    NativeDesktop::instance().applyAttributes(*windowHandle(), m_attributes);
    showFamily();
}

} // namespace penwick::platform
