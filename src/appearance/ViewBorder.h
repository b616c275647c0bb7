// SPDX-License-Identifier: MIT
// The border of a view.
#pragma once

class QColor;

namespace penwick {

namespace platform {
class View;
}

/// Gives the layer of `view` a border; width and radius in points. A view without a layer stays as
/// it is: whoever wants a border calls setWantsLayer() first.
void setViewBorder(
    platform::View &view, const QColor &borderColor, double borderWidth, double borderRadius);

} // namespace penwick
