// SPDX-License-Identifier: MIT
// The main function of the random sessions: an application on a screen that is not there, small
// so that painting takes no time.
#include <gtest/gtest.h>

#include <QApplication>

namespace {

QtMessageHandler former = nullptr;

// Without a screen there is no order of windows and no grab; that is said at every step.
void withoutPlugin(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (!message.startsWith(QStringLiteral("This plugin does not support")))
        former(type, context, message);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" PENWICK_SMALL_SCREEN);
    former = qInstallMessageHandler(withoutPlugin);
    const QApplication application(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    return RUN_ALL_TESTS();
}
