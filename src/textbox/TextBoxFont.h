// SPDX-License-Identifier: MIT
// The fonts of a text box.
#pragma once

#include <QFont>

#include <optional>

namespace penwick {

/// The desktop's own font. `size` is in points, which are logical pixels of the screen; instead of
/// a size that no font can have, the nearest possible one is used.
[[nodiscard]] QFont systemFontOf(double size);

/// The face with the name `face`, which is its family and its style, both without spaces, joined by
/// a hyphen, as in "DejaVuSans-Bold". Empty if no such face is installed.
[[nodiscard]] std::optional<QFont> fontNamed(const QString &face, double size);

/// The font of what is written: the preferred one where it is installed, else the desktop's own.
[[nodiscard]] QFont textFontOf(double size);

} // namespace penwick
