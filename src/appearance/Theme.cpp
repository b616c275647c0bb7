// SPDX-License-Identifier: MIT
#include "appearance/Theme.h"

namespace penwick {

const QHash<QString, QColor> &colorMap()
{
    static const QHash<QString, QColor> map {
        { QStringLiteral("black"), TnhColors::blackColor },
        { QStringLiteral("white"), TnhColors::whiteColor },
        { QStringLiteral("dark_grey"), TnhColors::greyColor },
        { QStringLiteral("dark_blue"), TnhColors::blueColor },
        { QStringLiteral("red"), TnhColors::redColor },
        { QStringLiteral("green"), TnhColors::greenColor },
        { QStringLiteral("yellow"), TnhColors::yellowColor },
        { QStringLiteral("light_grey"), TnhColors::lightGreyColor },
        { QStringLiteral("light_blue"), TnhColors::lightBlueColor },
    };
    return map;
}

} // namespace penwick
