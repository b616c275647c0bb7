// SPDX-License-Identifier: MIT
#include "platform/window/CaptureExclusion.h"

#include <QEvent>
#include <QWidget>

#include <algorithm>

namespace penwick::platform {

CaptureExclusion::CaptureExclusion(QWidget &window)
    : m_window(window)
{
    window.installEventFilter(this);
}

void CaptureExclusion::add(CaptureExclusion &child)
{
    if (child.m_parent == this)
        return;
    if (CaptureExclusion *const former = child.m_parent)
        former->remove(child);
    child.m_parent = this;
    m_children.emplace_back(&child);
    connect(&child, &QObject::destroyed, this, &CaptureExclusion::onChildGone);
    check();
}

void CaptureExclusion::remove(CaptureExclusion &child)
{
    if (child.m_parent != this)
        return;
    std::erase(m_children, &child);
    child.disconnect(this);
    child.m_parent = nullptr;
    check();
}

void CaptureExclusion::onChildGone()
{
    std::erase_if(m_children, [](const auto &child) { return child.isNull(); });
    check();
}

std::vector<QWidget *> CaptureExclusion::windows() const
{
    std::vector<QWidget *> windows;
    if (m_isLeftOut)
        windows.push_back(&m_window);
    for (const auto &child : m_children) {
        const std::vector<QWidget *> above = child->windows();
        windows.insert(windows.end(), above.begin(), above.end());
    }
    return windows;
}

std::vector<WId> CaptureExclusion::identifiers()
{
    std::vector<WId> identifiers;
    std::vector<Known> known;
    for (QWidget *const window : windows()) {
        identifiers.push_back(window->winId());
        known.push_back({ window, identifiers.back() });
    }
    m_known = std::move(known);
    return identifiers;
}

// A window whose identifier nobody has asked for yet may get one without news.
bool CaptureExclusion::isAsKnown(const std::vector<Known> &present) const
{
    return std::equal(present.begin(), present.end(), m_known.begin(), m_known.end(),
        [](const Known &now, const Known &before) {
            return now.window == before.window
                && (before.identifier == 0 || now.identifier == before.identifier);
        });
}

void CaptureExclusion::check()
{
    std::vector<Known> present;
    for (const QWidget *const window : windows())
        present.push_back({ window, window->internalWinId() });
    const bool isNews = !isAsKnown(present);
    m_known = std::move(present);
    const QPointer<CaptureExclusion> parent = m_parent; // whoever is told may end the window
    if (isNews)
        Q_EMIT changed();
    if (parent)
        parent->check();
}

bool CaptureExclusion::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::WinIdChange) {
        // The native window is being destroyed. Who is told now might ask for its identifier, which
        // would make it anew in the middle of that.
        if (m_window.internalWinId() == 0)
            QMetaObject::invokeMethod(this, &CaptureExclusion::check, Qt::QueuedConnection);
        else
            check();
    }
    return QObject::eventFilter(watched, event);
}

} // namespace penwick::platform
