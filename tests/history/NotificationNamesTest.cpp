// SPDX-License-Identifier: MIT
// The fixed names, letter for letter.
#include "history/NotificationNames.h"

#include <gtest/gtest.h>

#include <array>
#include <thread>
#include <vector>

namespace penwick::test {
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

TEST(NotificationNames, areMadeOnceAlsoFromSeveralThreadsAtATime)
{
    constexpr std::size_t threadCount = 8;
    std::array<std::array<const QString *, 4>, threadCount> seen {};
    std::vector<std::thread> threads;
    for (auto &own : seen) {
        threads.emplace_back([&own] {
            own = { &notificationPrefix(), &penwickNotificationKey(),
                &drawingViewUpdatedNotification(), &drawingCanvasSubviewUpdateNotification() };
        });
    }
    for (std::thread &thread : threads)
        thread.join();

    for (const auto &own : seen)
        EXPECT_EQ(own, seen[0]);
}

} // namespace
} // namespace penwick::test
