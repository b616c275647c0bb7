// SPDX-License-Identifier: MIT
#include "platform/window/WindowFamily.h"

#include <penwick/platform/Window.h>

namespace penwick::platform {

std::vector<Window *> WindowFamily::children() const
{
    std::vector<Window *> children;
    for (const auto &child : m_children) {
        if (child)
            children.push_back(child);
    }
    return children;
}

void WindowFamily::add(Window &child)
{
    m_children.emplace_back(&child);
}

void WindowFamily::remove(const Window &child)
{
    std::erase_if(m_children, [&child](const auto &each) { return each == &child; });
}

bool WindowFamily::canShow() const
{
    return !m_parent || (m_parent->isVisible() && !m_parent->isMinimized());
}

void WindowFamily::takeAlong(QPoint delta) const
{
    for (Window *const child : children()) {
        const Point origin = child->frame().origin();
        child->setFrameOrigin({ origin.x + delta.x(), origin.y - delta.y() });
    }
}

void raiseChildrenOf(const Window &window)
{
    for (Window *const child : window.childWindows()) {
        if (!child->isVisible())
            continue;
        child->raise();
        raiseChildrenOf(*child);
    }
}

} // namespace penwick::platform
