// SPDX-License-Identifier: MIT
// penwick-embed: a host that knows only the installed package.
#include "Tour.h"

#include <penwick/Version.h>

#include <QApplication>

#include <cstdio>
#include <cstring>

int main(int argumentCount, char **arguments)
{
    for (int index = 1; index < argumentCount; ++index) {
        if (std::strcmp(arguments[index], "--offscreen") == 0)
            qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    std::printf("Penwick %s (%g)\n", PenwickVersionString, PenwickVersionNumber);

    const QApplication application(argumentCount, arguments);
    Tour tour;
    QTimer::singleShot(0, &application, [&tour] { tour.openNext(); });
    return QApplication::exec();
}
