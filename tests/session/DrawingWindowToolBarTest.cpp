// SPDX-License-Identifier: MIT
// The drawing window and its tool bar: how the one is tied to the other.
#include "session/SessionFixture.h"

#include "appearance/PenwickBundle.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"
#include "session/DrawingWindowScene.h"
#include "session/SharingNotificationScene.h"
#include "session/ToolPanelScene.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/PopoverInterface.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QTest>

#include <memory>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Window;

constexpr auto missing = "Warning: ToolPanelWindowController not created!\n";

class DrawingWindowToolBar : public SessionFixture
{
protected:
    DrawingWindowToolBar()
        : m_controller(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()))
    { }

    void show()
    {
        m_controller->showWindow(nullptr);
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&panel()));
        QCoreApplication::processEvents();
    }

    [[nodiscard]] Window &drawing() const { return *m_controller->drawingWindow(); }
    [[nodiscard]] ToolBarPanelWindow &panel() const
    {
        return *m_controller->tPanelWindowController()->toolPanelWindow();
    }
    [[nodiscard]] Window &popover() const
    {
        return *m_controller->tPanelWindowController()->content().popoverW();
    }

    void openPopover()
    {
        m_controller->tPanelWindowController()->content().button(QStringLiteral("color"))->click();
        EXPECT_TRUE(popover().isVisible());
    }

    /// A drawing window as its scene loads it.
    static std::unique_ptr<DrawingWindowController> loaded()
    {
        auto object = makeDrawingWindowScene();
        auto *const controller = dynamic_cast<DrawingWindowController *>(object.get());
        static_cast<void>(object.release());
        return std::unique_ptr<DrawingWindowController>(controller);
    }

    /// The component's own resources but for the tool bar's scene, which is `maker`'s.
    static void useToolBar(const platform::Bundle::SceneMaker &maker)
    {
        auto bundle = std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images"));
        const QString main = QStringLiteral("Main");
        bundle->addScene(main, QStringLiteral("DrawingWindowController"), makeDrawingWindowScene);
        bundle->addScene(main, QStringLiteral("SharingNotificationWindowController"),
            makeSharingNotificationScene);
        if (maker)
            bundle->addScene(main, QStringLiteral("ToolPanelWindowController"), maker);
        setPenwickBundle(std::move(bundle));
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

using DrawingWindowToolBarDeathTest = DrawingWindowToolBar;

} // namespace

TEST_F(DrawingWindowToolBar, isAChildFromTheLoadingOn)
{
    const auto controller = loaded();

    ASSERT_NE(controller->tPanelWindowController(), nullptr);
    EXPECT_EQ(controller->tPanelWindowController()->toolPanelWindow()->parentWindow(),
        controller->drawingWindow());
    EXPECT_FALSE(controller->tPanelWindowController()->toolPanelWindow()->isVisible());
}

TEST_F(DrawingWindowToolBar, standsTwentyPointsInsideAndCentred)
{
    EXPECT_EQ(drawing().frame(), (Rect { 320, 180, 1280, 720 }));
    EXPECT_EQ(panel().frame(), (Rect { 340, 180 + 360 - 176, 52, 352 }));
    EXPECT_TRUE(panel().attributes().hasShadow);
}

TEST_F(DrawingWindowToolBar, isShownTogetherWithItsWindow)
{
    EXPECT_FALSE(panel().isVisible());

    show();

    EXPECT_TRUE(panel().isVisible());
    EXPECT_EQ(panel().frame(), (Rect { 340, 364, 52, 352 }));
}

TEST_F(DrawingWindowToolBar, followsAMoveOfItsWindow)
{
    show();

    drawing().setFrameOrigin({ 400, 100 });

    EXPECT_TRUE(QTest::qWaitFor([this] { return panel().frame().x == 420; }));
    EXPECT_EQ(panel().frame(), (Rect { 420, 284, 52, 352 }));
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 400, 100 }));
}

TEST_F(DrawingWindowToolBar, movesWithTheCornerWhenTheLeftEdgeIsDragged)
{
    show();

    drawing().setFrame({ 220, 180, 1380, 720 });

    EXPECT_TRUE(QTest::qWaitFor([this] { return panel().frame().x == 240; }));
    EXPECT_EQ(panel().frame(), (Rect { 240, 364, 52, 352 }));
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 220, 180 }));
}

TEST_F(DrawingWindowToolBar, movesOnceWhenTheSameStepIsToldTwice)
{
    show();
    drawing().setFrame({ 220, 180, 1380, 720 });

    m_controller->windowDidResize();
    m_controller->windowDidResize();

    EXPECT_EQ(panel().frame(), (Rect { 240, 364, 52, 352 }));
}

TEST_F(DrawingWindowToolBar, staysWhenTheRightEdgeIsDragged)
{
    show();

    drawing().setFrame({ 320, 180, 900, 720 });

    EXPECT_TRUE(QTest::qWaitFor([this] { return drawing().frameGeometry().width() == 900; }));
    QCoreApplication::processEvents();
    EXPECT_EQ(panel().frame(), (Rect { 340, 364, 52, 352 }));
}

TEST_F(DrawingWindowToolBar, isPulledBackWhenTheWindowShrinksAwayFromIt)
{
    show();
    panel().setFrameOrigin({ 1500, 364 });
    QCoreApplication::processEvents();

    drawing().setFrame({ 320, 180, 900, 720 });

    EXPECT_TRUE(QTest::qWaitFor([this] { return panel().frame().x == 320 + 900 - 3 - 52; }));
    EXPECT_EQ(panel().frame().y, 364);
}

TEST_F(DrawingWindowToolBar, closedWindowTakesItAlong)
{
    show();
    openPopover();

    drawing().close();

    EXPECT_FALSE(panel().isVisible());
    EXPECT_FALSE(popover().isVisible());
    EXPECT_EQ(ends(), std::vector<QVariant> { false });
}

TEST_F(DrawingWindowToolBar, comesBackWithAWindowThatIsShownAfterItWasClosed)
{
    show();
    drawing().close();
    ASSERT_FALSE(panel().isVisible());

    show();

    EXPECT_TRUE(drawing().isVisible());
    EXPECT_TRUE(panel().isVisible());
    EXPECT_EQ(panel().frame(), (Rect { 340, 364, 52, 352 }));
    openPopover();
    m_controller->tPanelWindowController()->content().button(QStringLiteral("state"))->click();
    EXPECT_FALSE(drawing().isVisible());
    EXPECT_EQ(ends(), (std::vector<QVariant> { false, false }));
}

TEST_F(DrawingWindowToolBar, comesBackWithUndoAndRedoAsTheyWere)
{
    show();
    ToolPanelViewController &bar = m_controller->tPanelWindowController()->content();
    bar.button(QStringLiteral("undo"))->setEnabled(true);

    drawing().close();
    show();

    EXPECT_TRUE(bar.button(QStringLiteral("undo"))->isEnabled());
    EXPECT_FALSE(bar.button(QStringLiteral("redo"))->isEnabled());
    bar.button(QStringLiteral("undo"))->setEnabled(false);
    bar.button(QStringLiteral("redo"))->setEnabled(true);
    drawing().close();
    show();
    EXPECT_FALSE(bar.button(QStringLiteral("undo"))->isEnabled());
    EXPECT_TRUE(bar.button(QStringLiteral("redo"))->isEnabled());
}

TEST_F(DrawingWindowToolBar, isNotBroughtToAWindowThatHadNone)
{
    const auto board
        = m_penwick.createDrawingWindowController(WindowType::imageAnnotation, primary());
    Window &bar = *board->tPanelWindowController()->window();
    board->showWindow(nullptr);
    board->windowDidMove(); // somebody has pulled it elsewhere

    board->drawingWindow()->close();
    board->showWindow(nullptr);

    EXPECT_FALSE(bar.isVisible());
}

TEST_F(DrawingWindowToolBar, isClosedBeforeTheEndIsTold)
{
    show();
    bool wasVisible = true;
    setReaction([&] { wasVisible = panel().isVisible(); });

    drawing().close();

    EXPECT_FALSE(wasVisible);
}

TEST_F(DrawingWindowToolBar, popoverIsHiddenWhenTheWindowBeginsToMove)
{
    show();
    openPopover();

    m_controller->windowWillMove();

    EXPECT_FALSE(popover().isVisible());
}

TEST_F(DrawingWindowToolBar, popoverIsHiddenWhenAnotherWindowTakesOver)
{
    show();
    openPopover();

    m_controller->windowDidResignMain();

    EXPECT_FALSE(popover().isVisible());
}

TEST_F(DrawingWindowToolBar, popoverThatIsNotThereNeedNotBeHidden)
{
    m_controller->hideThePopover(); // not shown
    dynamic_cast<DrawingCanvasView &>(*contentOf(drawing()).contentView())
        .setPopoverWindow(nullptr);
    m_controller->hideThePopover();
    contentOf(drawing()).setContentView(nullptr);
    m_controller->hideThePopover();
    m_controller->setDrawingWindow(nullptr);
    m_controller->hideThePopover();
}

TEST_F(DrawingWindowToolBar, anyWindowIsPlacedFromTheRecordedOrigin)
{
    Window window;
    window.setFrame({ 0, 0, 30, 40 });

    m_controller->setWindowPositionRelativeToMainWindow(window, 12.5, -7);

    EXPECT_EQ(window.frame(), (Rect { 332.5, 173, 30, 40 }));
}

TEST_F(DrawingWindowToolBar, resizeOfAWindowThatWasNeverPlacedMovesNothing)
{
    const auto controller = loaded();
    Window &bar = *controller->tPanelWindowController()->toolPanelWindow();
    const Rect before = bar.frame();

    controller->windowDidResize();

    EXPECT_EQ(bar.frame(), before);
    EXPECT_EQ(controller->drawingWindowOrigin(), std::nullopt);
}

TEST_F(DrawingWindowToolBar, placementAndResizeWithoutOneSaySo)
{
    DrawingWindowController controller;
    Window window;
    contentOf(window).setContentView(nullptr);
    testing::internal::CaptureStdout();

    controller.windowDidResize();

    EXPECT_EQ(testing::internal::GetCapturedStdout(), missing);
}

TEST_F(DrawingWindowToolBarDeathTest, unknownOriginStopsThePlacement)
{
    const auto controller = loaded();
    Window window;

    EXPECT_DEATH(controller->setWindowPositionRelativeToMainWindow(window, 0, 0),
        "penwick: fatal error: the drawing window has not been placed");
}

TEST_F(DrawingWindowToolBarDeathTest, missingSceneStopsTheProcess)
{
    useToolBar({});

    EXPECT_DEATH(loaded(), "penwick: fatal error: ");
}

TEST_F(DrawingWindowToolBarDeathTest, sceneOfAnotherClassStopsTheProcess)
{
    useToolBar([] { return std::make_unique<QObject>(); });

    EXPECT_DEATH(loaded(), "penwick: fatal error: the drawing window has no tool bar");
}

TEST_F(DrawingWindowToolBarDeathTest, missingPanelStopsTheProcess)
{
    useToolBar([] { return std::make_unique<ToolPanelWindowController>(); });

    EXPECT_DEATH(loaded(), "penwick: fatal error: the drawing window's tool bar has no panel");
}

} // namespace penwick::test
