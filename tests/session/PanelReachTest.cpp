// SPDX-License-Identifier: MIT
// A tool bar that is higher than its board: its end stays in reach, wherever the board is taken.
#include "session/SessionFixture.h"

#include "platform/foundation/Clock.h"
#include "session/ToolPanelWindowController.h"

#include <QTest>
#include <QWindow>

#include <memory>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;

class PanelReach : public SessionFixture
{
protected:
    PanelReach()
        : m_board(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()))
        , m_controller(*m_board->tPanelWindowController())
        , m_panel(*m_controller.toolPanelWindow())
    { }

    void show()
    {
        m_board->showWindow(nullptr);
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&m_panel));
        QCoreApplication::processEvents();
    }

    void takeBoardTo(Point corner)
    {
        const auto former = m_board->drawingWindowOrigin();
        m_board->window()->setFrameOrigin(corner); // or as near as this desktop grants
        EXPECT_TRUE(QTest::qWaitFor([&] { return m_board->drawingWindowOrigin() != former; }));
    }

    /// A board that is lower than its tool bar, which hangs from its title bar.
    void showSmallBoard()
    {
        show();
        m_board->window()->setFrame({ 600, 500, 320, 180 });
        EXPECT_TRUE(QTest::qWaitFor([this] {
            return m_panel.frame() == Rect({ 620, 500 + 180 - 25 - 352, 52, 352 });
        }));
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_board;
    ToolPanelWindowController &m_controller;
    ToolBarPanelWindow &m_panel;
};

} // namespace

// The screen is 1920 x 1080 and the panel 352 high.

TEST_F(PanelReach, ofASmallBoardKeepsItsEndOnTheScreenWhereverTheBoardIsTaken)
{
    show();
    m_board->window()->setFrame({ 600, 40, 320, 180 });
    QCoreApplication::processEvents();
    m_controller.adjustPosition(); // its upper edge below the board's title bar
    EXPECT_EQ(m_panel.frame().y, 0);
    EXPECT_TRUE(QTest::qWaitFor([this] { return m_panel.y() == 1080 - 352; }));

    m_board->window()->setFrameOrigin({ 600, 500 });
    QCoreApplication::processEvents();
    EXPECT_EQ(m_panel.frame().y, 500 + 180 - 25 - 352) << "its own place";

    m_board->window()->setFrameOrigin({ 600, 10 });
    QCoreApplication::processEvents();
    EXPECT_EQ(m_panel.frame().y, 0);
}

TEST_F(PanelReach, ofASmallBoardKeepsItsEndInReachSidewaysAndComesBackToItsPlace)
{
    showSmallBoard();
    const Rect place = m_panel.frame();

    takeBoardTo({ -200, 500 });
    EXPECT_EQ(m_panel.frame(), (Rect { 0, place.y, 52, 352 }));
    takeBoardTo({ -200, 1000 });
    EXPECT_EQ(m_panel.frame(), (Rect { 0, 1080 - 352, 52, 352 }));
    m_controller.adjustPosition(); // as after a resize
    EXPECT_EQ(m_panel.frame(), (Rect { 0, 1080 - 352, 52, 352 }));

    takeBoardTo({ 600, 500 });
    EXPECT_EQ(m_panel.frame(), place);
}

TEST_F(PanelReach, thatIsDraggedInReachHasItsPlaceThere)
{
    showSmallBoard();
    takeBoardTo({ -200, 500 });
    ASSERT_EQ(m_panel.frame().x, 0);

    m_controller.mouseDown();
    m_panel.setFrameOrigin({ 50, m_panel.frame().y });
    m_controller.adjustPosition();
    const double distance = 50 - m_board->window()->frame().x;
    takeBoardTo({ 600, 500 });

    EXPECT_EQ(m_panel.frame().x, 600 + distance);
}

TEST_F(PanelReach, thatTheDesktopsOwnMeansMoveHasItsPlaceThere)
{
    showSmallBoard();
    takeBoardTo({ -200, 500 });
    ASSERT_EQ(m_panel.frame().x, 0);
    platform::Clock::ofTheDesktop().letPass(platform::Clock::Time(1000)); // its request is over

    m_panel.windowHandle()->setPosition(40, m_panel.y());
    ASSERT_TRUE(QTest::qWaitFor([this] { return m_panel.frame().x == 40; }));
    takeBoardTo({ -190, 500 });

    EXPECT_EQ(m_panel.frame().x, 50);
}

TEST_F(PanelReach, thatAnEarlierReleaseAdjustsInTheMiddleOfADragStandsWhereItIsLetGo)
{
    showSmallBoard();
    takeBoardTo({ -200, 500 });
    m_controller.mouseDown();
    m_panel.setFrameOrigin({ -30, m_panel.frame().y });
    m_controller.adjustPosition(); // what the earlier release has left for later

    m_panel.setFrameOrigin({ 10, m_panel.frame().y });
    m_controller.mouseUp();
    m_controller.adjustPosition();

    EXPECT_EQ(m_panel.frame().x, 10);
}

TEST_F(PanelReach, ofAPictureThatIsShownAgainIsBesideItOnceMore)
{
    QImage picture(480, 200, QImage::Format_RGB32);
    picture.fill(Qt::lightGray);
    const auto controller
        = m_penwick.createDrawingWindowController(WindowType::imageAnnotation, primary(), picture);
    auto &panel = *controller->tPanelWindowController()->toolPanelWindow();
    controller->showWindow(nullptr);
    EXPECT_TRUE(QTest::qWaitForWindowExposed(&panel));
    controller->window()->setFrameOrigin({ -200, 500 });
    ASSERT_TRUE(QTest::qWaitFor([&panel] { return panel.frame().x == 0; }));
    controller->window()->hide();

    controller->showWindow(nullptr);

    EXPECT_EQ(controller->window()->frame().x, 0);
    EXPECT_EQ(panel.frame().x, 20);
}

TEST_F(PanelReach, thatIsPlacedAnewHasItsPlaceThere)
{
    showSmallBoard();
    takeBoardTo({ -200, 500 });
    ASSERT_EQ(m_panel.frame().x, 0);

    m_panel.setFrameOrigin({ 10, 400 });
    m_controller.takeItsPlace();
    const double distance = 10 - m_board->window()->frame().x;
    takeBoardTo({ 600, 500 });

    EXPECT_EQ(m_panel.frame().x, 600 + distance);
}

TEST_F(PanelReach, ofASmallBoardGoesToTheScreenOfItsBoard)
{
    showSmallBoard();

    takeBoardTo({ 1880, 500 });
    EXPECT_EQ(m_panel.frame().x, 1920) << "most of it lies there";
    takeBoardTo({ 3170, 500 });
    EXPECT_EQ(m_panel.frame().x, 3200 - 52);
    takeBoardTo({ 3190, 500 });
    EXPECT_EQ(m_panel.frame().x, 3200 - 52) << "though its own place is on no screen";
}

TEST_F(PanelReach, ofASmallPictureStandsOnTheScreenFromTheStart)
{
    QImage image(480, 60, QImage::Format_RGB32);
    image.fill(Qt::gray);

    m_board
        = m_penwick.createDrawingWindowController(WindowType::imageAnnotation, secondary(), image);

    // Centred beside the picture it would stand at 280 + 30 - 176; the screen begins at 160.
    EXPECT_EQ(m_board->window()->frame(), (Rect { 1920 + 1280.0 / 6, 280, 480, 60 }));
    EXPECT_EQ(m_board->tPanelWindowController()->toolPanelWindow()->frame().y, 160);
}

TEST_F(PanelReach, thatFitsItsBoardLeavesTheScreenWithIt)
{
    show();
    const Rect before = m_panel.frame();
    m_board->window()->setFrameOrigin({ 320, -400 });
    QCoreApplication::processEvents();

    m_controller.adjustPosition();

    EXPECT_EQ(m_panel.frame().y, before.y - 580);
}

} // namespace penwick::test
