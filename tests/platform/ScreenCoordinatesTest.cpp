// SPDX-License-Identifier: MIT
// Between Qt's desktop and points that count upwards, on two screens.
#include "platform/window/ScreenCoordinates.h"

#include <penwick/platform/Window.h>

#include <QGuiApplication>
#include <QScreen>

#include <gtest/gtest.h>

namespace penwick::platform {

TEST(ScreenCoordinates, originIsThePrimaryScreensBottomLeftCorner)
{
    EXPECT_EQ(fromDesktop(QRect(0, 1080 - 30, 40, 30)), (Rect { 0.0, 0.0, 40.0, 30.0 }));
    EXPECT_EQ(toDesktop({ 0.0, 0.0, 40.0, 30.0 }), QRect(0, 1050, 40, 30));
}

TEST(ScreenCoordinates, rectangleComesBackAsItWas)
{
    const QRect onTheSecondScreen(2000, 300, 123, 45);

    EXPECT_EQ(fromDesktop(onTheSecondScreen), (Rect { 2000.0, 735.0, 123.0, 45.0 }));
    EXPECT_EQ(toDesktop(fromDesktop(onTheSecondScreen)), onTheSecondScreen);
}

TEST(ScreenCoordinates, rectangleBelowThePrimaryScreenIsNegative)
{
    EXPECT_EQ(fromDesktop(QRect(-10, 1100, 5, 20)), (Rect { -10.0, -40.0, 5.0, 20.0 }));
}

TEST(ScreenCoordinates, fractionsAreRoundedAndTheSizeIsTheSameEverywhere)
{
    EXPECT_EQ(toDesktop({ 10.4, 10.4, 20.6, 20.6 }), QRect(10, 1049, 21, 21));
    EXPECT_EQ(toDesktop({ 10.6, 10.6, 20.6, 20.6 }), QRect(11, 1049, 21, 21));
}

TEST(ScreenCoordinates, frameOfAScreenIsInTheSameCoordinates)
{
    const QList<QScreen *> screens = QGuiApplication::screens();
    ASSERT_EQ(screens.size(), 2);

    EXPECT_EQ(frameOfScreen(*screens[0]), (Rect { 0.0, 0.0, 1920.0, 1080.0 }));
    EXPECT_EQ(frameOfScreen(*screens[1]), (Rect { 1920.0, 160.0, 1280.0, 720.0 }));
}

} // namespace penwick::platform
