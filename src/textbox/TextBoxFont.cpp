// SPDX-License-Identifier: MIT
#include "textbox/TextBoxFont.h"

#include "platform/view/OwnLook.h"

#include <QFontDatabase>
#include <QStringList>

namespace penwick {

namespace {

constexpr char16_t beforeStyle = u'-'; // in the name of a face

bool isSameWithoutSpaces(const QString &name, QStringView wanted)
{
    auto next = wanted.begin();
    for (const QChar letter : name) {
        if (letter == u' ')
            continue;
        if (next == wanted.end() || letter != *next)
            return false;
        ++next;
    }
    return next == wanted.end();
}

} // namespace

QFont systemFontOf(double size)
{
    return platform::ownFont(size);
}

std::optional<QFont> fontNamed(const QString &face, double size)
{
    const auto hyphen = face.lastIndexOf(beforeStyle);
    if (hyphen < 0)
        return std::nullopt;
    const QStringView all(face);
    for (const QString &family : QFontDatabase::families()) {
        if (!isSameWithoutSpaces(family, all.first(hyphen)))
            continue;
        for (const QString &style : QFontDatabase::styles(family)) {
            if (isSameWithoutSpaces(style, all.sliced(hyphen + 1)))
                return platform::ownFont(size, QFontDatabase::font(family, style, 1));
        }
    }
    return std::nullopt;
}

QFont textFontOf(double size)
{
    static const QString preferred = QStringLiteral("ProximaNova-Regular");
    const std::optional<QFont> font = fontNamed(preferred, size);
    return font ? *font : systemFontOf(size);
}

} // namespace penwick
