// SPDX-License-Identifier: MIT
// Words that stay inside the place that they are given, however long they are.
#pragma once

#include <QFont>
#include <QString>

namespace penwick::platform {

/// What of a text is shown, and in which size.
struct FittedText
{
    QString string; ///< shortened where it had to be
    QFont font; ///< smaller where it had to be
    bool isWhole = true; ///< the whole text in its own size
};

/// `text` in `font`, no wider than `width` points: smaller first, down to where it can still be
/// read, then shortened. `font` has a size in points of the screen's logical pixels.
[[nodiscard]] FittedText fittedText(const QString &text, const QFont &font, double width);

} // namespace penwick::platform
