// SPDX-License-Identifier: MIT
#include "platform/native/NativeWindowValues.h"

#include <gtest/gtest.h>

namespace penwick::platform {

TEST(NativeWindowValues, rawValuesAreHandedOnAsTheyAre)
{
    WindowAttributes attributes;
    attributes.styleMask = 32768 | 1;
    attributes.collectionBehavior = 257;
    attributes.level = 24;
    attributes.sharingType = 0;
    attributes.titleVisibility = 1;
    attributes.animationBehavior = 5;
    attributes.titlebarAppearsTransparent = true;
    attributes.hasShadow = false;

    const NativeWindowValues values = nativeWindowValues(attributes);

    EXPECT_EQ(values.styleMask, 32769U);
    EXPECT_EQ(values.collectionBehavior, 257U);
    EXPECT_EQ(values.level, 24);
    EXPECT_EQ(values.sharingType, 0U);
    EXPECT_EQ(values.titleVisibility, 1);
    EXPECT_EQ(values.animationBehavior, 5);
    EXPECT_TRUE(values.titlebarAppearsTransparent);
    EXPECT_FALSE(values.hasShadow);
    EXPECT_TRUE(values.isOnAllDesktops);
    EXPECT_TRUE(values.isLeftOutOfCaptures);
}

TEST(NativeWindowValues, ordinaryWindowIsOnOneDesktopAndInCaptures)
{
    const NativeWindowValues values = nativeWindowValues(WindowAttributes());

    EXPECT_FALSE(values.isOnAllDesktops);
    EXPECT_FALSE(values.isLeftOutOfCaptures);
    EXPECT_EQ(values.sharingType, 1U);
}

} // namespace penwick::platform
