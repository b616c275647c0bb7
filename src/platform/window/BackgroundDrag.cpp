// SPDX-License-Identifier: MIT
#include "platform/window/BackgroundDrag.h"

#include "platform/window/ScreenCoordinates.h"

namespace penwick::platform {

void BackgroundDrag::begin(const Rect &frame, QPoint pointer)
{
    m_grab = pointer - toDesktop(frame).topLeft();
}

std::optional<Rect> BackgroundDrag::moved(const Rect &frame, QPoint pointer) const
{
    if (!m_grab)
        return std::nullopt;
    return fromDesktop(QRect(pointer - *m_grab, toDesktop(frame).size()));
}

} // namespace penwick::platform
