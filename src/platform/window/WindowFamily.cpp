// SPDX-License-Identifier: MIT
#include "platform/window/WindowFamily.h"

namespace penwick::platform {

WindowFamily::WindowFamily(Window &window)
    : m_window(window)
{ }

WindowFamily::~WindowFamily()
{
    leaveParent();
    for (WindowFamily *const child : m_children)
        child->m_parent = nullptr;
}

void WindowFamily::leaveParent()
{
    if (m_parent)
        std::erase(m_parent->m_children, this);
    m_parent = nullptr;
}

Window *WindowFamily::parent() const
{
    return m_parent ? &m_parent->m_window : nullptr;
}

std::vector<Window *> WindowFamily::children() const
{
    std::vector<Window *> children;
    for (WindowFamily *const child : m_children)
        children.push_back(&child->m_window);
    return children;
}

void WindowFamily::add(WindowFamily &child)
{
    child.leaveParent();
    child.m_parent = this;
    m_children.push_back(&child);
}

} // namespace penwick::platform
