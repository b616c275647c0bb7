// SPDX-License-Identifier: MIT
// Which of a window's movements are told, and in which order.
#include "platform/window/FrameTracker.h"

#include <QCoreApplication>
#include <QTest>
#include <QTimer>
#include <QWidget>
#include <QWindow>

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace penwick::platform {

namespace {

const Rect place { 300.0, 400.0, 200.0, 100.0 };

/// A borderless widget, so that Qt's geometry is the outer frame.
class FrameTrackerTest : public testing::Test
{
protected:
    using Log = std::vector<std::string>;

    FrameTrackerTest()
        : m_tracker(*new FrameTracker(m_widget))
    {
        m_widget.setWindowFlags(Qt::Window | Qt::FramelessWindowHint);
        QObject::connect(&m_tracker, &FrameTracker::resized, &m_widget,
            [this] { m_log.emplace_back("resized"); });
        QObject::connect(&m_tracker, &FrameTracker::shifted, &m_widget, [this](QPoint delta) {
            m_log.push_back(
                "shifted " + std::to_string(delta.x()) + ',' + std::to_string(delta.y()));
        });
        QObject::connect(
            &m_tracker, &FrameTracker::moved, &m_widget, [this] { m_log.emplace_back("moved"); });
    }

    void show()
    {
        m_tracker.request(place);
        m_tracker.prepareToShow();
        m_widget.show();
        settle();
        m_log.clear();
    }

    /// Lets everything arrive that is under way.
    void settle()
    {
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&m_widget));
        bool isOver = false;
        // Timers that are due at once run in the order in which they were started.
        QTimer::singleShot(0, &m_widget, [&isOver] { isOver = true; });
        EXPECT_TRUE(QTest::qWaitFor([&isOver] { return isOver; }));
    }

    Log m_log;
    QWidget m_widget;
    FrameTracker &m_tracker; // the widget's
};

} // namespace

TEST_F(FrameTrackerTest, requestIsTheFrameAtOnceAndTellsNothing)
{
    m_tracker.request(place);

    EXPECT_EQ(m_tracker.frame(), place);
    EXPECT_EQ(m_widget.size(), QSize(200, 100));
    EXPECT_EQ(m_log, Log {});
}

TEST_F(FrameTrackerTest, windowThatIsShownWhereItWasAskedTellsNothing)
{
    m_tracker.request(place);
    m_tracker.prepareToShow();
    m_widget.show();
    settle();

    EXPECT_EQ(m_tracker.frame(), place);
    EXPECT_EQ(m_widget.geometry(), QRect(300, 580, 200, 100));
    EXPECT_EQ(m_log, Log {});
}

TEST_F(FrameTrackerTest, moveIsAShiftThenAMove)
{
    show();

    m_tracker.request({ 310.0, 420.0, 200.0, 100.0 });
    settle();

    EXPECT_EQ(m_log, (Log { "shifted 10,-20", "moved" }));
}

TEST_F(FrameTrackerTest, resizeAtTheRightAndTheBottomIsNoMove)
{
    show();

    m_tracker.request({ 300.0, 350.0, 250.0, 150.0 });
    settle();

    EXPECT_EQ(m_log, Log { "resized" });
}

TEST_F(FrameTrackerTest, resizeAtTheLeftIsToldBeforeTheMoveAndShiftsNothing)
{
    show();

    m_tracker.request({ 250.0, 400.0, 250.0, 100.0 });
    settle();

    EXPECT_EQ(m_log, (Log { "resized", "moved" }));
}

TEST_F(FrameTrackerTest, sameFrameIsToldToNobody)
{
    show();

    m_tracker.request(place);
    settle();

    EXPECT_EQ(m_log, Log {});
}

TEST_F(FrameTrackerTest, severalRequestsInOneGoAreOneMove)
{
    show();

    m_tracker.request({ 310.0, 400.0, 200.0, 100.0 });
    m_tracker.request({ 320.0, 400.0, 200.0, 100.0 });
    m_tracker.request({ 330.0, 400.0, 200.0, 100.0 });
    settle();

    EXPECT_EQ(m_log, (Log { "shifted 30,0", "moved" }));
}

TEST_F(FrameTrackerTest, moveByTheDesktopIsTheNewFrame)
{
    show();

    m_widget.windowHandle()->setPosition(350, 600);

    EXPECT_TRUE(QTest::qWaitFor([this] { return !m_log.empty(); }));
    EXPECT_EQ(m_tracker.frame(), (Rect { 350.0, 380.0, 200.0, 100.0 }));
    EXPECT_EQ(m_log, (Log { "shifted 50,20", "moved" }));
}

TEST_F(FrameTrackerTest, sizeThatIsNotGrantedIsGivenUpForTheGrantedOne)
{
    m_widget.setMaximumSize(150, 80);
    show();

    EXPECT_TRUE(QTest::qWaitFor([this] { return m_tracker.frame().width == 150.0; }));
    EXPECT_EQ(m_tracker.frame(), (Rect { 300.0, 420.0, 150.0, 80.0 }));
}

TEST_F(FrameTrackerTest, hiddenWindowRemembersWhatItIsAsked)
{
    show();
    m_widget.hide();

    m_tracker.request({ 10.0, 20.0, 30.0, 40.0 });
    QCoreApplication::processEvents();

    EXPECT_EQ(m_tracker.frame(), (Rect { 10.0, 20.0, 30.0, 40.0 }));
    EXPECT_EQ(m_log, Log {});
}

} // namespace penwick::platform
