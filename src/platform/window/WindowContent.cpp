// SPDX-License-Identifier: MIT
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

namespace penwick::platform {

WindowContent::WindowContent(Window &window)
    : ViewHost(window)
    , m_window(window)
{ }

View *WindowContent::contentView() const
{
    return m_window.contentView();
}

View *WindowContent::firstResponder() const
{
    return m_window.firstResponder();
}

bool WindowContent::makeFirstResponder(View *view)
{
    return m_window.makeFirstResponder(view);
}

bool WindowContent::isKeyWindow() const
{
    return m_window.isKeyWindow();
}

QColor WindowContent::backgroundColor() const
{
    return m_window.attributes().backgroundColor;
}

void WindowContent::close()
{
    m_window.close();
}

void WindowContent::forgetView(const View &view)
{
    m_window.forgetView(view);
}

} // namespace penwick::platform
