// SPDX-License-Identifier: MIT
#include "textbox/TextBoxFont.h"

#include <QFontDatabase>

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

constexpr double smallestFont = 1.0; // points
constexpr double largestFont = 1000.0; // points; beyond it no line would fit a screen

} // namespace

QFont systemFontOf(double size)
{
    QFont font = QFontDatabase::systemFont(QFontDatabase::GeneralFont);
    font.setPixelSize(static_cast<int>(std::lround(std::clamp(size, smallestFont, largestFont))));
    return font;
}

QFont textFontOf(double size)
{
    static const QString preferred = QStringLiteral("ProximaNova-Regular");
    QFont font = systemFontOf(size);
    if (QFontDatabase::hasFamily(preferred))
        font.setFamily(preferred);
    return font;
}

} // namespace penwick
