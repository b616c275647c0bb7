// SPDX-License-Identifier: MIT
// A desktop whose protocol nobody speaks does nothing, and does not fail.
#include "platform/native/NativeDesktop.h"

#include <QWindow>

#include <gtest/gtest.h>

namespace penwick::platform {

TEST(NativeDesktop, applicationWithoutADesktopHasNoNativeOne)
{
    EXPECT_EQ(makeNativeDesktop(), nullptr);
}

TEST(NativeDesktop, doNothingDesktopTellsNoMarginsBeforehand)
{
    QWindow window;
    window.create();

    EXPECT_EQ(NativeDesktop::instance().frameMarginsBeforeShow(window), std::nullopt);
    EXPECT_EQ(&NativeDesktop::instance(), &NativeDesktop::instance());
}

} // namespace penwick::platform
