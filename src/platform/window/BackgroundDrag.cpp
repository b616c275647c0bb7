// SPDX-License-Identifier: MIT
#include "platform/window/BackgroundDrag.h"

#include <penwick/platform/Window.h>

#include "platform/window/ScreenCoordinates.h"

namespace penwick::platform {

void BackgroundDrag::begin(const Window &window, QPoint pointer)
{
    const WindowAttributes &attributes = window.attributes();
    if (attributes.isMovable && attributes.isMovableByWindowBackground)
        m_grab = pointer - toDesktop(window.frame()).topLeft();
}

void BackgroundDrag::goOn(Window &window, QPoint pointer) const
{
    if (m_grab)
        window.setFrame(fromDesktop(QRect(pointer - *m_grab, toDesktop(window.frame()).size())));
}

} // namespace penwick::platform
