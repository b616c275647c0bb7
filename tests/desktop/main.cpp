// SPDX-License-Identifier: MIT
// Entry of the desktop tests.
#include <gtest/gtest.h>

int main(int argumentCount, char **arguments)
{
    testing::InitGoogleTest(&argumentCount, arguments);
    return RUN_ALL_TESTS();
}
