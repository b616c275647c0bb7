// SPDX-License-Identifier: MIT
#include "platform/view/FittedText.h"

#include <QFontMetricsF>

namespace penwick::platform {

namespace {

constexpr int smallestReadable = 9; // points

} // namespace

FittedText fittedText(const QString &text, const QFont &font, double width)
{
    if (QFontMetricsF(font).horizontalAdvance(text) <= width)
        return { text, font };
    QFont smaller = font;
    for (int size = font.pixelSize() - 1; size >= smallestReadable; --size) {
        smaller.setPixelSize(size);
        if (QFontMetricsF(smaller).horizontalAdvance(text) <= width)
            return { text, smaller, false };
    }
    return { QFontMetricsF(smaller).elidedText(text, Qt::ElideRight, width), smaller, false };
}

} // namespace penwick::platform
