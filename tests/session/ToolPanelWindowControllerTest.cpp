// SPDX-License-Identifier: MIT
// The tool bar's window: what it is like, and how it is kept inside the drawing window.
#include "session/SessionFixture.h"

#include "session/ToolPanelScene.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include "appearance/PenwickBundle.h"
#include "platform/window/WindowContent.h"

#include <QTest>
#include <QTimer>

#include <memory>

namespace penwick::test {

namespace {

using platform::Rect;
using platform::Window;

class ToolPanelWindow : public SessionFixture
{
protected:
    ToolPanelWindow()
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

    /// A tool bar that belongs to no window.
    static std::unique_ptr<ToolPanelWindowController> loaded()
    {
        auto object = makeToolPanelScene(*penwickBundle());
        auto *const controller = dynamic_cast<ToolPanelWindowController *>(object.get());
        static_cast<void>(object.release());
        return std::unique_ptr<ToolPanelWindowController>(controller);
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_board;
    ToolPanelWindowController &m_controller;
    ToolBarPanelWindow &m_panel;
};

using ToolPanelWindowDeathTest = ToolPanelWindow;

} // namespace

TEST_F(ToolPanelWindow, newControllerHasNoPanel)
{
    const ToolPanelWindowController controller;

    EXPECT_EQ(controller.toolPanelWindow(), nullptr);
    EXPECT_EQ(controller.popoverWindow(), nullptr);
    EXPECT_EQ(controller.window(), nullptr);
}

TEST_F(ToolPanelWindow, controllerOfAWindowFromElsewhereHasNothingElse)
{
    auto window = std::make_unique<Window>();
    const Window *const taken = window.get();

    const ToolPanelWindowController controller(std::move(window));

    EXPECT_EQ(controller.window(), taken);
    EXPECT_EQ(contentOf(*taken).responder(), &controller);
    EXPECT_EQ(taken->delegate(), nullptr) << "it was not loaded";
    EXPECT_EQ(controller.toolPanelWindow(), nullptr);
    EXPECT_EQ(controller.popoverWindow(), nullptr);
}

TEST_F(ToolPanelWindow, windowForThePopoverIsKeptAndLeftAlone)
{
    auto window = std::make_shared<Window>();
    const std::weak_ptr<Window> kept = window;

    m_controller.setPopoverWindow(std::move(window));

    ASSERT_FALSE(kept.expired());
    EXPECT_EQ(m_controller.popoverWindow(), kept.lock());
    EXPECT_NE(m_controller.popoverWindow().get(), m_controller.content().popoverW());
    m_controller.setPopoverWindow(nullptr);
    EXPECT_TRUE(kept.expired());
}

TEST_F(ToolPanelWindow, panelIsWhatItsFourWordsSay)
{
    const Rect frame { 10, 20, 60, 400 };

    const ToolBarPanelWindow panel(frame,
        platform::StyleMask::resizable | platform::StyleMask::fullSizeContentView,
        platform::BackingStore::Buffered, true);

    EXPECT_EQ(panel.frame(), frame);
    EXPECT_EQ(panel.attributes().styleMask.toInt(), 8U + 32768U);
    EXPECT_FALSE(panel.isVisible());
}

TEST_F(ToolPanelWindow, panelsDelegateIsItsController)
{
    EXPECT_EQ(m_panel.delegate(), &m_controller);
}

TEST_F(ToolPanelWindow, loadedPanelHasItsAttributes)
{
    const auto controller = loaded();
    const platform::WindowAttributes &attributes = controller->toolPanelWindow()->attributes();

    EXPECT_EQ(controller->window(), controller->toolPanelWindow());
    EXPECT_EQ(contentOf(*controller->toolPanelWindow()).responder(), controller.get());
    EXPECT_EQ(attributes.backgroundColor.alpha(), 0);
    EXPECT_FALSE(attributes.isOpaque);
    EXPECT_EQ(attributes.collectionBehavior.toInt(), 257U);
    EXPECT_TRUE(attributes.titlebarAppearsTransparent);
    EXPECT_EQ(attributes.styleMask.toInt() & 15U, 0U);
    EXPECT_EQ(attributes.styleMask.toInt() & 32768U, 32768U);
    EXPECT_EQ(attributes.titleVisibility, platform::TitleVisibility::hidden);
    EXPECT_FALSE(attributes.showsToolbarButton);
    EXPECT_TRUE(attributes.isMovableByWindowBackground);
    EXPECT_EQ(attributes.sharingType, platform::SharingType::none);
    EXPECT_EQ(attributes.level, platform::WindowLevel::mainMenu);
}

TEST_F(ToolPanelWindow, neverTakesTheKeys)
{
    EXPECT_TRUE(m_panel.windowFlags().testFlag(Qt::WindowDoesNotAcceptFocus));
    EXPECT_TRUE(m_panel.testAttribute(Qt::WA_ShowWithoutActivating));
    show();

    EXPECT_TRUE(contentOf(*m_board->window()).isKeyWindow());
}

TEST_F(ToolPanelWindow, buttonsLieInsideThePanelAndApart)
{
    const auto buttons = m_panel.findChildren<ToolPanelButton *>();
    ASSERT_EQ(buttons.size(), 8);
    for (const ToolPanelButton *const one : buttons) {
        const QRect area(one->mapTo(&m_panel, QPoint()), one->size());
        EXPECT_TRUE(m_panel.rect().contains(area));
        for (const ToolPanelButton *const other : buttons) {
            EXPECT_TRUE(one == other
                || !area.intersects(QRect(other->mapTo(&m_panel, QPoint()), other->size())));
        }
    }
}

TEST_F(ToolPanelWindow, outOfItsParentGlidesBack)
{
    show();
    m_panel.setFrameOrigin({ 100, 300 });
    QCoreApplication::processEvents();

    m_controller.adjustPosition();

    EXPECT_EQ(m_panel.frame(), (Rect { 343, 300, 52, 352 })); // where it is going to
    EXPECT_NE(m_panel.x(), 343); // it is on its way
    EXPECT_TRUE(QTest::qWaitFor([this] { return m_panel.x() == 343; }));
    EXPECT_EQ(m_panel.frame(), (Rect { 343, 300, 52, 352 }));
}

TEST_F(ToolPanelWindow, insideItsParentStays)
{
    show();
    m_panel.setFrameOrigin({ 700, 400 });
    QCoreApplication::processEvents();

    m_controller.adjustPosition();

    EXPECT_EQ(m_panel.frame(), (Rect { 700, 400, 52, 352 }));
}

TEST_F(ToolPanelWindow, withoutAParentIsNeverMoved)
{
    const auto controller = loaded();
    controller->toolPanelWindow()->setFrameOrigin({ -500, -500 });

    controller->adjustPosition();

    EXPECT_EQ(controller->toolPanelWindow()->frame(), (Rect { -500, -500, 52, 352 }));
}

TEST_F(ToolPanelWindow, isAdjustedTwoTenthsOfASecondAfterTheButtonWasLetGo)
{
    show();
    m_panel.setFrameOrigin({ 100, 300 });
    QCoreApplication::processEvents();

    m_controller.mouseUp();

    auto *const waiting = m_controller.findChild<QTimer *>();
    ASSERT_NE(waiting, nullptr);
    EXPECT_EQ(waiting->interval(), 200);
    EXPECT_TRUE(waiting->isSingleShot());
    EXPECT_EQ(m_panel.frame().x, 100);
    QTimerEvent itsTime(waiting->timerId());
    QCoreApplication::sendEvent(waiting, &itsTime);
    EXPECT_EQ(m_panel.frame().x, 343);
}

TEST_F(ToolPanelWindow, everyReleaseIsFollowedByOneAdjustment)
{
    show();
    m_controller.mouseUp();
    m_controller.mouseUp();

    EXPECT_EQ(m_controller.findChildren<QTimer *>().size(), 2);

    EXPECT_TRUE(QTest::qWaitFor([this] { return !m_controller.findChild<QTimer *>(); }));
}

TEST_F(ToolPanelWindow, controllerThatDiesBeforeItIsAdjustedIsLeftAlone)
{
    show();
    m_controller.mouseUp();

    m_board.reset();
    static_cast<void>(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()));
    deleteWhatIsLeft();

    QTest::qWait(0);
}

TEST_F(ToolPanelWindow, pressOnTheBackgroundHidesThePopover)
{
    show();
    Window &popover = *m_controller.content().popoverW();
    m_controller.content().button(QStringLiteral("color"))->click();
    ASSERT_TRUE(popover.isVisible());

    QTest::mousePress(&m_panel, Qt::LeftButton, {}, { 2, 8 });
    EXPECT_FALSE(popover.isVisible());
    m_controller.mouseDown(); // with nothing to hide
    QTest::mouseRelease(&m_panel, Qt::LeftButton, {}, { 2, 8 });
}

TEST_F(ToolPanelWindow, handleIsDragged)
{
    show();
    QTest::mousePress(&m_panel, Qt::LeftButton, {}, { 26, 8 });

    QTest::mouseMove(&m_panel, { 126, 58 });
    EXPECT_EQ(m_panel.frame(), (Rect { 440, 364 - 50, 52, 352 }));
    QTest::mouseRelease(&m_panel, Qt::LeftButton, {}, { 26, 8 });
}

TEST_F(ToolPanelWindow, buttonsAreNotDragged)
{
    show();
    const Rect before = m_panel.frame();
    auto *const eraser = m_controller.content().button(QStringLiteral("eraser"));

    QTest::mousePress(eraser, Qt::LeftButton, {}, { 5, 5 });
    QTest::mouseMove(eraser, { 30, 30 });
    QTest::mouseRelease(eraser, Qt::LeftButton, {}, { 30, 30 });

    EXPECT_EQ(m_panel.frame(), before);
}

TEST_F(ToolPanelWindowDeathTest, loadingWithoutAPanelStopsTheProcess)
{
    ToolPanelWindowController controller;

    EXPECT_DEATH(controller.windowDidLoad(), "penwick: fatal error: the tool bar has no panel");
}

TEST_F(ToolPanelWindowDeathTest, pressWithoutAPanelStopsTheProcess)
{
    m_controller.setToolPanelWindow(nullptr);

    EXPECT_DEATH(m_controller.mouseDown(), "penwick: fatal error: the tool bar has no panel");
}

TEST_F(ToolPanelWindowDeathTest, pressWithAnotherContentStopsTheProcess)
{
    contentOf(m_panel).setContentViewController(nullptr);

    EXPECT_DEATH(
        m_controller.mouseDown(), "penwick: fatal error: the panel's content is no tool bar");
}

TEST_F(ToolPanelWindowDeathTest, pressBeforeThePopoverWindowIsThereStopsTheProcess)
{
    contentOf(m_panel).setContentViewController(std::make_unique<ToolPanelViewController>());

    EXPECT_DEATH(
        m_controller.mouseDown(), "penwick: fatal error: the tool bar has no popover window");
}

} // namespace penwick::test
