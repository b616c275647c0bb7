// SPDX-License-Identifier: MIT
// The picture of what a window holds: each view paints itself as content, without what belongs to
// its being edited or shown.
#include <penwick/platform/Window.h>

#include "platform/foundation/GuiThread.h"
#include "platform/view/View.h"
#include "platform/window/WindowParts.h"

#include <QImage>
#include <QPainter>

namespace penwick::platform {

QImage Window::contentImage() const
{
    requireGuiThread();
    const double scale = devicePixelRatioF();
    QImage image((QSizeF(size()) * scale).toSize(), QImage::Format_ARGB32_Premultiplied);
    if (image.isNull())
        return image;
    image.setDevicePixelRatio(scale);
    image.fill(m_attributes.backgroundColor);
    QPainter painter(&image);
    for (View *const view : d->content.topViews())
        view->paintContent(painter);
    return image;
}

} // namespace penwick::platform
