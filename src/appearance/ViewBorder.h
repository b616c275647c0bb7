// SPDX-License-Identifier: MIT
// The border of a view.
#pragma once

class QColor;

namespace penwick {

namespace platform {
class View;
}

/// Gives `view`'s layer that border; widths and radii in points. A view without a layer stays as
/// it is: who wants a border asks for a layer first.
void setViewBorder(
    platform::View &view, const QColor &borderColor, double borderWidth, double borderRadius);

} // namespace penwick
