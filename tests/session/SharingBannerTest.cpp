// SPDX-License-Identifier: MIT
// The banner over a drawing window: what it looks like, when it comes and when it goes.
#include "session/SessionFixture.h"

#include "platform/view/View.h"

#include <QPixmap>
#include <QTest>
#include <QTimer>

#include <memory>

namespace penwick::test {

namespace {

using platform::Rect;
using platform::Window;

class SharingBanner : public SessionFixture
{
protected:
    SharingBanner()
        : m_controller(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()))
        , m_banner(*m_controller->sharingNotificationWindow())
    { }

    /// What waits to close the banner, the oldest first.
    [[nodiscard]] QList<QTimer *> closings() const
    {
        return m_controller->findChildren<QTimer *>(QString(), Qt::FindDirectChildrenOnly);
    }

    /// Lets `timer` fire now.
    static void fire(QTimer &timer)
    {
        ASSERT_TRUE(timer.isActive());
        QTimerEvent event(timer.timerId());
        QCoreApplication::sendEvent(&timer, &event);
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
    Window &m_banner;
};

} // namespace

TEST_F(SharingBanner, isClosedOneAndAHalfSecondsAfterItWasAskedFor)
{
    m_controller->showWindow(nullptr);

    m_penwick.showWindowSharingNotification();

    ASSERT_EQ(closings().size(), 1);
    EXPECT_EQ(closings().first()->interval(), 1500);
    EXPECT_TRUE(closings().first()->isSingleShot());
    EXPECT_TRUE(m_banner.isVisible());
    fire(*closings().first());
    EXPECT_FALSE(m_banner.isVisible());
}

TEST_F(SharingBanner, askedForTwiceIsClosedByTheEarlierAsking)
{
    m_controller->showWindow(nullptr);
    m_penwick.showWindowSharingNotification();
    m_penwick.showWindowSharingNotification();
    const QList<QTimer *> both = closings();
    ASSERT_EQ(both.size(), 2);

    fire(*both.first());
    EXPECT_FALSE(m_banner.isVisible());
    fire(*both.last());
    EXPECT_FALSE(m_banner.isVisible());
}

TEST_F(SharingBanner, askedForBeforeTheBoardIsShownComesUpWithIt)
{
    m_penwick.showWindowSharingNotification();
    EXPECT_FALSE(m_banner.isVisible());

    m_controller->showWindow(nullptr);

    EXPECT_TRUE(m_banner.isVisible());
    EXPECT_EQ(m_banner.frame(), (Rect { 810, 510, 300, 60 }));
    fire(*closings().first());
    EXPECT_FALSE(m_banner.isVisible());
}

TEST_F(SharingBanner, boardThatComesAfterItsTimeComesAlone)
{
    m_penwick.showWindowSharingNotification();
    fire(*closings().first());

    m_controller->showWindow(nullptr);

    EXPECT_TRUE(m_controller->window()->isVisible());
    EXPECT_FALSE(m_banner.isVisible());
}

TEST_F(SharingBanner, askedForWhileTheBoardIsMinimisedComesBackWithIt)
{
    m_controller->showWindow(nullptr);
    Window &board = *m_controller->window();
    board.setWindowState(Qt::WindowMinimized);
    m_penwick.showWindowSharingNotification();
    EXPECT_FALSE(m_banner.isVisible());

    board.setWindowState(Qt::WindowNoState);

    EXPECT_TRUE(m_banner.isVisible());
}

TEST_F(SharingBanner, goesAndComesWithABoardThatIsHiddenInItsTime)
{
    m_controller->showWindow(nullptr);
    m_penwick.showWindowSharingNotification();

    m_controller->window()->hide();
    EXPECT_FALSE(m_banner.isVisible());
    m_controller->showWindow(nullptr);

    EXPECT_TRUE(m_banner.isVisible());
}

TEST_F(SharingBanner, groundIsHalfTransparentInPixelsAndItsCornersAreClear)
{
    m_controller->showWindow(nullptr);
    m_penwick.showWindowSharingNotification();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&m_banner));

    const QImage seen = m_banner.grab().toImage().convertToFormat(QImage::Format_ARGB32);

    ASSERT_EQ(seen.size(), QSize(300, 60));
    for (const QPoint corner : { QPoint(0, 0), QPoint(299, 0), QPoint(0, 59), QPoint(299, 59) })
        EXPECT_EQ(seen.pixelColor(corner).alpha(), 0);
    for (const QPoint ground : { QPoint(4, 30), QPoint(150, 3), QPoint(295, 56) }) {
        const QColor color = seen.pixelColor(ground);
        EXPECT_NEAR(color.alpha(), 128, 1);
        EXPECT_NEAR(color.red(), 85, 1);
        EXPECT_NEAR(color.green(), 85, 1);
        EXPECT_NEAR(color.blue(), 85, 1);
    }
    EXPECT_TRUE(m_banner.testAttribute(Qt::WA_TranslucentBackground));
    EXPECT_EQ(m_banner.attributes().backgroundColor.alpha(), 0);
}

TEST_F(SharingBanner, anyWindowIsMadeABannerTheSameWay)
{
    Window window;
    window.setFrame({ 0, 0, 40, 30 });

    m_controller->setNotificationWindowProperties(window);

    EXPECT_FALSE(window.attributes().isOpaque);
    EXPECT_EQ(window.attributes().sharingType, platform::SharingType::none);
    EXPECT_TRUE(window.attributes().titlebarAppearsTransparent);
    EXPECT_EQ(window.attributes().backgroundColor, QColor(Qt::transparent));
    EXPECT_EQ(window.grab().toImage().pixelColor(10, 10).alpha(), 0);
}

} // namespace penwick::test
