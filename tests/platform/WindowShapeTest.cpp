// SPDX-License-Identifier: MIT
// What becomes of a window that the user pulls out of its shape.
#include "platform/window/WindowShape.h"
#include "platform/WindowFixture.h"
#include "platform/window/FrameTracker.h"

#include <QWindow>

namespace penwick::platform {

namespace {

class WindowShapeTest : public WindowFixture
{
protected:
    WindowShapeTest()
    {
        WindowAttributes attributes;
        attributes.styleMask |= StyleMask::resizable;
        attributes.aspectRatio = Size { 16.0, 9.0 };
        m_window.setAttributes(attributes);
    }

    void showAt(const Rect &frame)
    {
        m_window.setFrame(frame);
        show(m_window);
        // Whatever is open between window and desktop is dealt with.
        bool isSettled = false;
        QObject hears;
        QObject::connect(
            &m_window, &Window::frameSettled, &hears, [&isSettled] { isSettled = true; });
        ASSERT_TRUE(QTest::qWaitFor([&] { return isSettled; }));
    }

    /// What the user does with the mouse at the window's edges.
    void pullTo(const Rect &frame)
    {
        QWindow &native = *m_window.windowHandle();
        const QRect outer(static_cast<int>(frame.x), static_cast<int>(1080 - frame.maxY()),
            static_cast<int>(frame.width), static_cast<int>(frame.height));
        native.setGeometry(outer.marginsRemoved(native.frameMargins()));
        ASSERT_TRUE(QTest::qWaitFor([&] { return m_window.frame() == frame; }));
    }

    /// Asks for `frame` of a desktop that gives no window less than 420 points of height.
    void askForLow(const Rect &frame)
    {
        m_window.setMinimumSize(0, 420);
        m_window.setFrame(frame);
        ASSERT_TRUE(QTest::qWaitFor([&] { return m_window.frame().height >= 420; }));
        m_window.setMinimumSize(0, 0);
    }

    /// Whether the time is awaited after which the user has stopped pulling.
    [[nodiscard]] bool isRestAwaited() const
    {
        const auto *const shape = m_window.findChild<WindowShape *>();
        const auto *const alarm = shape ? shape->findChild<Alarm *>() : nullptr;
        return alarm && alarm->at().has_value();
    }

    void rest()
    {
        ASSERT_TRUE(isRestAwaited());
        Clock::ofTheUser().letPass(Clock::Time(200));
    }
};

const Rect place { 300, 200, 600, 450 };

} // namespace

TEST_F(WindowShapeTest, ofAnotherShapeIsLeftAloneUntilItIsPulled)
{
    showAt(place);

    EXPECT_EQ(m_window.frame(), place);
}

TEST_F(WindowShapeTest, pulledOutwardBecomesLarger)
{
    showAt(place);
    pullTo({ 300, 200, 612, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 200, 800, 450 }));
    settle(m_window);
    EXPECT_EQ(reallyAt(m_window), (Rect { 300, 200, 800, 450 }));
}

TEST_F(WindowShapeTest, onePullOfManyStepsCountsFromItsBeginning)
{
    showAt(place);
    pullTo({ 300, 200, 700, 450 });
    pullTo({ 300, 200, 640, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 200, 800, 450 }));
}

TEST_F(WindowShapeTest, nextPullCountsFromWhereTheLastOneEnded)
{
    showAt(place);
    pullTo({ 300, 200, 612, 450 });
    rest();
    settle(m_window);
    QCoreApplication::processEvents();

    pullTo({ 300, 200, 640, 450 });
    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 290, 640, 360 }));
}

TEST_F(WindowShapeTest, pulledInwardBecomesSmaller)
{
    showAt(place);
    pullTo({ 300, 200, 480, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 380, 480, 270 }));
}

TEST_F(WindowShapeTest, leftEdgeIsTheOneThatGoesOn)
{
    showAt(place);
    pullTo({ 288, 200, 612, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 100, 200, 800, 450 }));
}

TEST_F(WindowShapeTest, pulledBackToItsOwnSizeKeepsItsShape)
{
    showAt(place);
    pullTo({ 300, 200, 612, 450 });
    pullTo(place);

    rest();

    EXPECT_EQ(m_window.frame(), place);
}

TEST_F(WindowShapeTest, pulledBeyondTheScreenIsNoLargerThanTheScreen)
{
    WindowAttributes attributes = m_window.attributes();
    attributes.aspectRatio = Size { 3.0, 1.0 };
    m_window.setAttributes(attributes);
    showAt(place);
    pullTo({ 300, 100, 600, 800 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 0, 100, 1920, 640 }));
}

TEST_F(WindowShapeTest, thatTheDesktopPutsIntoHalfOfTheScreenStaysInThatHalf)
{
    showAt({ 300, 200, 640, 360 });
    pullTo({ 960, 0, 960, 1080 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 960, 540, 960, 540 }));
}

TEST_F(WindowShapeTest, movedWhileItIsPulledCountsFromWhereItWas)
{
    showAt(place);
    m_window.setFrameOrigin({ 320, 210 });
    settle(m_window);
    QCoreApplication::processEvents();
    pullTo({ 308, 210, 612, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 120, 210, 800, 450 }));
}

TEST_F(WindowShapeTest, thatTheDesktopMadeHigherIsAskedBackAndNotMadeWider)
{
    showAt({ 300, 200, 800, 450 });
    askForLow({ 300, 290, 640, 360 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 290, 640, 360 }));
}

TEST_F(WindowShapeTest, ofAnotherShapeThatTheDesktopMadeHigherIsLeftAlone)
{
    showAt({ 300, 200, 800, 450 });

    askForLow({ 300, 290, 640, 400 });

    EXPECT_FALSE(isRestAwaited());
}

TEST_F(WindowShapeTest, thatTheUserCannotResizeIsLeftAlone)
{
    showAt(place);
    WindowAttributes attributes = m_window.attributes();
    attributes.styleMask.setFlag(StyleMask::resizable, false);
    m_window.setAttributes(attributes);
    settle(m_window);
    pullTo({ 300, 200, 612, 450 });

    rest();

    EXPECT_EQ(m_window.frame(), (Rect { 300, 200, 612, 450 }));
}

} // namespace penwick::platform
