// SPDX-License-Identifier: MIT
// The fonts of a text box.
#pragma once

#include <QFont>

namespace penwick {

/// The desktop's own font. `size` is in points of the screen's logical pixels; one that no line of
/// text could have is taken for the nearest that it could.
[[nodiscard]] QFont systemFontOf(double size);

/// The font of what is written: the preferred one where it is installed, else the desktop's own.
[[nodiscard]] QFont textFontOf(double size);

} // namespace penwick
