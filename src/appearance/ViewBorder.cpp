// SPDX-License-Identifier: MIT
#include "appearance/ViewBorder.h"

#include "platform/view/View.h"

namespace penwick {

void setViewBorder(
    platform::View &view, const QColor &borderColor, double borderWidth, double borderRadius)
{
    platform::Layer *const layer = view.layer();
    if (!layer)
        return;
    layer->borderColor = borderColor;
    layer->borderWidth = borderWidth;
    layer->cornerRadius = borderRadius;
    view.setNeedsDisplay();
}

} // namespace penwick
