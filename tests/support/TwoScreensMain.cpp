// SPDX-License-Identifier: MIT
// The main function of tests that need windows placed: an application on two screens that are not
// there, 1920 x 1080 and, to the right of it and 200 lower, 1280 x 720.
#include <gtest/gtest.h>

#include <QApplication>

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" PENWICK_TWO_SCREENS);
    const QApplication application(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    // An application has threads: a forked child that goes on from here could hang on their locks.
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    return RUN_ALL_TESTS();
}
