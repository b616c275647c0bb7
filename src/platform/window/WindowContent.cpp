// SPDX-License-Identifier: MIT
#include "platform/window/WindowContent.h"

#include "platform/foundation/FatalError.h"
#include "platform/view/View.h"
#include "platform/view/ViewController.h"
#include "platform/window/FrameTracker.h"

#include <QWidget>

#include <utility>

namespace penwick::platform {

WindowContent &contentOf(const QWidget &window)
{
    return *require(window.findChild<WindowContent *>(QString(), Qt::FindDirectChildrenOnly),
        "a widget that is no window has no content");
}

WindowContent::WindowContent(QWidget &window, FrameTracker &tracker)
    : ViewHost(window)
    , m_window(window)
    , m_tracker(tracker)
{ }

WindowContent::~WindowContent() = default;

void WindowContent::end()
{
    // A view that is destroyed together with its window does not resign.
    m_firstResponder = nullptr;
    releaseContentView();
}

// The views

void WindowContent::setContentView(View *view)
{
    if (view != m_contentView)
        releaseContentView();
    m_contentView = view;
    if (!view)
        return;
    if (view->widget().parentWidget() != &m_window) {
        m_isContentBorrowed = true;
        view->widget().setParent(&m_window);
        view->announceWindow();
        view->widget().show();
    }
    view->setFrame({ 0.0, 0.0, static_cast<double>(m_window.width()),
        static_cast<double>(m_window.height()) });
}

void WindowContent::releaseContentView()
{
    if (!m_contentView || !std::exchange(m_isContentBorrowed, false))
        return;
    m_contentView->widget().hide();
    m_contentView->widget().setParent(nullptr);
    m_contentView = nullptr;
}

ViewController *WindowContent::contentViewController() const
{
    return m_contentViewController.get();
}

void WindowContent::setContentViewController(std::unique_ptr<ViewController> controller)
{
    m_contentViewController = std::move(controller);
    if (m_contentViewController) {
        m_contentViewController->setParent(&m_window); // so that findChild() finds it
        setContentView(m_contentViewController->view());
    }
}

void WindowContent::adoptScene()
{
    m_tracker.request({ 0.0, 0.0, static_cast<double>(m_window.width()),
        static_cast<double>(m_window.height()) });
    for (View *const view : topViews()) {
        view->adoptScene();
        view->announceWindow();
    }
}

std::vector<View *> WindowContent::topViews() const
{
    std::vector<View *> views;
    for (QObject *const child : m_window.children()) {
        if (auto *const view = dynamic_cast<View *>(child))
            views.push_back(view);
    }
    return views;
}

void WindowContent::place()
{
    for (View *const view : topViews()) {
        if (view == m_contentView)
            setContentView(view);
        else
            view->place();
    }
}

void WindowContent::setBackgroundColor(const QColor &color)
{
    m_backgroundColor = color;
    if (m_contentView) // it may show the background itself
        m_contentView->setNeedsDisplay();
}

// Responders

bool WindowContent::makeFirstResponder(View *view)
{
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
            m_firstResponder = view && view->window() == this ? view : nullptr;
    }
    QWidget &receiver = m_firstResponder ? m_firstResponder->widget() : m_window;
    receiver.setFocus(Qt::OtherFocusReason);
    return m_firstResponder == view;
}

bool WindowContent::isKeyWindow() const
{
    return m_window.isActiveWindow();
}

void WindowContent::forgetView(const View &view)
{
    if (m_firstResponder == &view)
        m_firstResponder = nullptr;
    if (m_contentView == &view)
        m_contentView = nullptr;
}

} // namespace penwick::platform
