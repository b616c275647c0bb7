// SPDX-License-Identifier: MIT
#include "soak/SmallScreen.h"

#include <QString>

namespace penwick::test {

namespace {

QtMessageHandler former = nullptr;

// Keeps back what the toolkit says whenever a window is raised or the pointer grabbed: without a
// screen it can do neither.
void withoutPlugin(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (!message.startsWith(QStringLiteral("This plugin does not support")))
        former(type, context, message);
}

} // namespace

void useSmallScreen()
{
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" PENWICK_SMALL_SCREEN);
    former = qInstallMessageHandler(withoutPlugin);
}

} // namespace penwick::test
