// SPDX-License-Identifier: MIT
// Printed lines, byte for byte.
#include "platform/foundation/StandardOutput.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using penwick::platform::printLine;

TEST(StandardOutput, lineIsWrittenAsItIsAndEndsInOneLineFeed)
{
    ::testing::internal::CaptureStdout();

    printLine("100 %s of \"it\"!");
    printLine("");

    EXPECT_EQ(::testing::internal::GetCapturedStdout(), "100 %s of \"it\"!\n\n");
}

TEST(StandardOutput, lineMayHoldAnyByte)
{
    ::testing::internal::CaptureStdout();

    printLine(std::string_view("a\0b", 3));

    EXPECT_EQ(::testing::internal::GetCapturedStdout(), std::string("a\0b\n", 4));
}

} // namespace
