// SPDX-License-Identifier: MIT
// The main function of the random sessions: an application on a screen that is not there, small
// so that painting takes no time.
#include "soak/SmallScreen.h"

#include <gtest/gtest.h>

#include <QApplication>

int main(int argc, char **argv)
{
    penwick::test::useSmallScreen();
    const QApplication application(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    return RUN_ALL_TESTS();
}
