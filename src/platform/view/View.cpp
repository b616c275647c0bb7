// SPDX-License-Identifier: MIT
#include "platform/view/View.h"

#include "platform/foundation/FatalError.h"
#include "platform/foundation/ObjectIdentifier.h"
#include "platform/view/ViewHost.h"
#include "platform/view/ViewInput.h"

#include <QPainter>
#include <QWidget>

#include <algorithm>
#include <cmath>

namespace penwick::platform {

namespace {

int rounded(double value)
{
    return static_cast<int>(std::lround(value));
}

} // namespace

View::View(QWidget &widget)
    : m_widget(widget)
    , m_hash(nextObjectIdentifier())
{ }

View::~View()
{
    forgetInside();
    if (m_superview)
        detachFrom(*m_superview);
    for (const Subview &subview : m_subviews) {
        subview.view->m_superview = nullptr;
        // A subview that somebody else holds must not be destroyed together with this widget.
        if (subview.strong)
            subview.view->m_widget.setParent(nullptr);
    }
}

bool View::resignFirstResponder()
{
    return !m_nextResponder.get() || m_nextResponder.get()->resignFirstResponder();
}

void View::pressIsComing()
{
    Q_EMIT ViewInput::shared().pressed(*this);
}

void View::keyIsComing()
{
    Q_EMIT ViewInput::shared().keyPressed(*this);
}

// Geometry

void View::setFrame(const Rect &frame)
{
    m_frame = frame;
    place();
}

void View::setFrameOrigin(Point origin)
{
    setFrame({ origin.x, origin.y, m_frame.width, m_frame.height });
}

void View::place()
{
    const QWidget *const around = m_widget.parentWidget();
    const double height = around ? around->height() : m_frame.maxY();
    // Place and size are rounded apart, so that a view that is moved never changes its size.
    const QRect geometry(rounded(m_frame.x), rounded(height - m_frame.maxY()),
        rounded(m_frame.width), rounded(m_frame.height));
    if (m_widget.geometry() != geometry)
        m_widget.setGeometry(geometry);
}

void View::widgetResized(Size former)
{
    for (View *const view : subviews()) {
        view->place();
        view->superviewDidResize(former);
    }
}

Point View::toWindow(Point point) const
{
    if (isFlipped())
        point.y = m_frame.height - point.y;
    for (const View *view = this; view; view = view->m_superview)
        point = point + view->m_frame.origin();
    return point;
}

Point View::fromWindow(Point point) const
{
    for (const View *view = this; view; view = view->m_superview)
        point = point - view->m_frame.origin();
    if (isFlipped())
        point.y = m_frame.height - point.y;
    return point;
}

Point View::convertTo(Point point, const View *view) const
{
    const Point inWindow = toWindow(point);
    return view ? view->fromWindow(inWindow) : inWindow;
}

Point View::convertFrom(Point point, const View *view) const
{
    return fromWindow(view ? view->toWindow(point) : point);
}

Point View::locationInWindow(double x, double y) const
{
    const QWidget *const top = m_widget.window();
    const QPointF position = surface().mapTo(top, QPointF(x, y));
    return { position.x(), top->height() - position.y() };
}

QRectF View::toSurface(const Rect &rect) const
{
    const double top = isFlipped() ? rect.y : m_widget.height() - rect.maxY();
    return { rect.x, top, rect.width, rect.height };
}

Rect View::fromSurface(const QRectF &rect) const
{
    const double y = isFlipped() ? rect.y() : m_widget.height() - rect.y() - rect.height();
    return { rect.x(), y, rect.width(), rect.height() };
}

// The tree

std::vector<View *> View::subviews() const
{
    std::vector<View *> views;
    views.reserve(m_subviews.size());
    for (const Subview &subview : m_subviews)
        views.push_back(subview.view);
    return views;
}

void View::addSubview(const std::shared_ptr<View> &view)
{
    if (view->m_superview == this)
        return;
    view->removeFromSuperview();
    view->m_superview = this;
    m_subviews.push_back({ view.get(), view });
    view->m_widget.setParent(&m_widget);
    view->place();
    view->m_widget.setVisible(!view->m_isHidden);
    view->m_widget.raise();
    restack();
    view->announceWindow();
}

void View::restack()
{
    for (const Subview &subview : m_subviews) {
        if (subview.view->m_isAboveSiblings)
            subview.view->m_widget.raise();
    }
}

void View::setAboveSiblings(bool isAbove)
{
    m_isAboveSiblings = isAbove;
    if (m_superview)
        m_superview->restack();
}

void View::setSubviews(const std::vector<View *> &views)
{
    for (View *const present : subviews()) {
        const bool isKept = std::find(views.begin(), views.end(), present) != views.end();
        // A view that was removed before this one may have removed this one as it resigned.
        if (!isKept && present->m_superview == this)
            present->removeFromSuperview();
    }
    std::vector<Subview> ordered;
    for (View *const view : views) {
        const auto place = std::find_if(m_subviews.begin(), m_subviews.end(),
            [view](const Subview &subview) { return subview.view == view; });
        if (place == m_subviews.end())
            continue;
        ordered.push_back(*place);
        view->m_widget.raise();
    }
    m_subviews = std::move(ordered);
    restack();
}

void View::removeFromSuperview()
{
    if (!m_superview)
        return;
    resignInside();
    if (!m_superview) // it removed itself while it resigned
        return;
    forgetInside(); // it leaves even if it would not resign
    const std::shared_ptr<View> keptUntilDone = [this] {
        for (const Subview &subview : m_superview->m_subviews) {
            if (subview.view == this)
                return subview.strong;
        }
        return std::shared_ptr<View>();
    }();
    detachFrom(*m_superview);
    m_widget.hide();
    m_widget.setParent(nullptr);
    announceWindow();
}

void View::detachFrom(View &superview)
{
    std::erase_if(
        superview.m_subviews, [this](const Subview &subview) { return subview.view == this; });
    m_superview = nullptr;
}

void View::resignInside()
{
    ViewHost *const ownWindow = window();
    if (!ownWindow)
        return;
    for (const View *view = ownWindow->firstResponder(); view; view = view->m_superview) {
        if (view == this) {
            ownWindow->makeFirstResponder(nullptr);
            return;
        }
    }
}

void View::forgetInside()
{
    ViewHost *const ownWindow = window();
    if (!ownWindow)
        return;
    ownWindow->forgetView(*this);
    for (View *const view : subviews())
        view->forgetInside();
}

ViewHost *View::window() const
{
    return ViewHost::of(m_widget);
}

void View::setHidden(bool hidden)
{
    m_isHidden = hidden;
    if (m_superview || m_widget.parentWidget())
        m_widget.setVisible(!hidden);
}

void View::adoptScene()
{
    const QWidget *const around = m_widget.parentWidget();
    const QRect place = m_widget.geometry();
    const double height = around ? around->height() : place.height();
    m_frame = { static_cast<double>(place.x()), height - place.y() - place.height(),
        static_cast<double>(place.width()), static_cast<double>(place.height()) };
    for (QObject *const child : m_widget.children()) {
        auto *const view = dynamic_cast<View *>(child);
        if (!view || view->m_superview)
            continue;
        view->m_superview = this;
        m_subviews.push_back({ view, nullptr });
        view->adoptScene();
    }
    awakeFromScene();
}

void View::announceWindow()
{
    viewDidMoveToWindow();
    for (View *const view : subviews())
        view->announceWindow();
}

// Appearance

void View::drawContent(QPainter &) { }

void View::paintContent(QPainter &painter)
{
    if (m_isHidden)
        return;
    painter.save();
    painter.setClipRect(m_widget.geometry(), Qt::IntersectClip);
    painter.translate(m_widget.pos());
    painter.save();
    drawContent(painter); // may bring subviews back
    painter.restore();
    for (View *const view : subviews())
        view->paintContent(painter);
    painter.restore();
}

void View::setWantsLayer(bool wantsLayer)
{
    m_wantsLayer = wantsLayer;
    setNeedsDisplay();
}

Layer *View::layer()
{
    for (const View *view = this; view; view = view->m_superview) {
        if (view->m_wantsLayer)
            return &m_layer;
    }
    return nullptr;
}

void View::setNeedsDisplay()
{
    surface().update();
}

void View::setNeedsDisplay(const Rect &rect)
{
    // Only what lies inside the view: a rectangle may be too large for whole numbers.
    surface().update(toSurface(rect).intersected(surface().rect()).toAlignedRect());
}

void View::addCursorRect(const Rect &rect, const Cursor &cursor)
{
    if (!(rect == bounds()))
        fatalError("a cursor rectangle covers its view's bounds");
    m_cursor = cursor;
    surface().setCursor(cursor.forScale(m_widget.devicePixelRatioF()));
}

void View::addGestureRecognizer(PanGestureRecognizer &recognizer)
{
    removeGestureRecognizer(recognizer);
    m_gestureRecognizers.push_back(&recognizer);
}

void View::removeGestureRecognizer(PanGestureRecognizer &recognizer)
{
    std::erase(m_gestureRecognizers, &recognizer);
}

std::vector<PanGestureRecognizer *> View::gestureRecognizers() const
{
    return m_gestureRecognizers;
}

void View::refreshCursorRects()
{
    m_cursor.reset();
    surface().unsetCursor();
    resetCursorRects();
    if (m_cursor && surface().underMouse())
        m_cursor->set(surface());
}

void View::pointerEntered()
{
    if (m_cursor)
        m_cursor->set(surface());
    else
        refreshCursorRects();
}

} // namespace penwick::platform
