// SPDX-License-Identifier: MIT
// Windows that stand beside a gliding window and follow it.
#include "session/SessionFixture.h"

#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QCoreApplication>
#include <QMouseEvent>
#include <QTest>
#include <QVariantAnimation>

#include <memory>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Window;

class GlidingWindows : public SessionFixture
{
protected:
    GlidingWindows()
        : m_controller(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()))
    {
        m_controller->showWindow(nullptr);
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&panel()));
        QCoreApplication::processEvents();
    }

    [[nodiscard]] Window &board() const { return *m_controller->drawingWindow(); }
    [[nodiscard]] ToolPanelWindowController &bar() const
    {
        return *m_controller->tPanelWindowController();
    }
    [[nodiscard]] Window &panel() const { return *bar().toolPanelWindow(); }

    [[nodiscard]] static QVariantAnimation *wayOf(const Window &window)
    {
        return window.findChild<QVariantAnimation *>();
    }

    /// Lets `window` be half way.
    static void goHalfWay(const Window &window)
    {
        ASSERT_NE(wayOf(window), nullptr);
        wayOf(window)->pause();
        wayOf(window)->setCurrentTime(wayOf(window)->duration() / 2);
    }

    static void arrive(const Window &window)
    {
        if (wayOf(window))
            wayOf(window)->resume();
        ASSERT_TRUE(QTest::qWaitFor([&window] { return !wayOf(window); }));
        QCoreApplication::processEvents();
    }

    /// Sends the tool bar from the left of the board back into it.
    void sendBarBack()
    {
        panel().setFrameOrigin({ board().frame().x - 200, panel().frame().y });
        QCoreApplication::processEvents();
        bar().adjustPosition();
    }

    void mouse(QEvent::Type type, const QPoint &global)
    {
        const bool isHeld = type != QEvent::MouseButtonRelease;
        QMouseEvent event(type, panel().mapFromGlobal(global), global,
            type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton,
            isHeld ? Qt::LeftButton : Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(&panel(), &event);
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

} // namespace

TEST_F(GlidingWindows, boardThatIsPlacedAnewHasItsToolBarBesideIt)
{
    const Rect place = board().frame();
    board().setFrameOrigin({ place.x + 153, place.y });
    QCoreApplication::processEvents();

    m_controller->createWindowForApplication(
        WindowType::whiteboard, *primary(), std::nullopt, std::nullopt);

    EXPECT_EQ(board().frame().x, place.x);
    EXPECT_EQ(panel().frame().x, place.x + 20);
    goHalfWay(board());
    EXPECT_EQ(panel().frame().x, place.x + 20);
    arrive(board());
    EXPECT_EQ(board().frame().x, place.x);
    EXPECT_EQ(panel().frame().x, place.x + 20);
}

TEST_F(GlidingWindows, barThatIsTakenHoldOfOnItsWayStaysUnderThePointer)
{
    sendBarBack();
    goHalfWay(panel());
    const QPoint seen = panel().geometry().topLeft();
    const QPoint pointer = seen + QPoint(5, 5);

    mouse(QEvent::MouseButtonPress, pointer);
    EXPECT_EQ(wayOf(panel()), nullptr);
    mouse(QEvent::MouseMove, pointer + QPoint(7, 3));

    EXPECT_EQ(panel().geometry().topLeft(), seen + QPoint(7, 3));
    mouse(QEvent::MouseButtonRelease, pointer + QPoint(7, 3));
}

TEST_F(GlidingWindows, popoverThatIsOpenedOnTheWayStandsWhereTheBarWillBe)
{
    sendBarBack();
    goHalfWay(panel());

    bar().content().button(QStringLiteral("color"))->click();
    const Window &popover = *bar().content().popoverW();
    const Rect opened = popover.frame();
    arrive(panel());

    EXPECT_EQ(popover.frame(), opened);
    EXPECT_EQ(panel().frame().x, board().frame().x + 23);
    EXPECT_GE(opened.x, panel().frame().maxX());
    EXPECT_LT(opened.x, panel().frame().maxX() + 20);
}

} // namespace penwick::test
