// SPDX-License-Identifier: MIT
// The fixed names, letter for letter.
#include "history/NotificationNames.h"

#include <gtest/gtest.h>

namespace penwick {
namespace {

TEST(NotificationNames, areThePrefixAndTheirFixedSuffix)
{
    EXPECT_EQ(notificationPrefix().toStdString(), "org.penwick");
    EXPECT_EQ(penwickNotificationKey().toStdString(), "org.penwick.penwik.notification");
    EXPECT_EQ(drawingViewUpdatedNotification().toStdString(),
        "org.penwick.penwick.notification.drawingview.update");
    EXPECT_EQ(drawingCanvasSubviewUpdateNotification().toStdString(),
        "org.penwick.penwick.notification.drawsubview.update");
}

TEST(NotificationNames, areMadeOnce)
{
    EXPECT_EQ(&penwickNotificationKey(), &penwickNotificationKey());
    EXPECT_EQ(&drawingViewUpdatedNotification(), &drawingViewUpdatedNotification());
    EXPECT_EQ(&drawingCanvasSubviewUpdateNotification(), &drawingCanvasSubviewUpdateNotification());
}

} // namespace
} // namespace penwick
