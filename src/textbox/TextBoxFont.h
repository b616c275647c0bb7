// SPDX-License-Identifier: MIT
// The fonts of a text box.
#pragma once

#include <QFont>

#include <optional>

namespace penwick {

/// The desktop's own font. `size` is in points of the screen's logical pixels; one that no line of
/// text could have is taken for the nearest that it could.
[[nodiscard]] QFont systemFontOf(double size);

/// The one face that is called `face`: its family and its style without their spaces, a hyphen
/// between them, as in "DejaVuSans-Bold". Nothing where it is not installed.
[[nodiscard]] std::optional<QFont> fontNamed(const QString &face, double size);

/// The font of what is written: the preferred one where it is installed, else the desktop's own.
[[nodiscard]] QFont textFontOf(double size);

} // namespace penwick
