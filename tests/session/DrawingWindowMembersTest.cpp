// SPDX-License-Identifier: MIT
// What the drawing window's controller and the entry object hold, and who may set it.
#include "session/SessionFixture.h"

#include "platform/window/WindowContent.h"
#include "session/DrawingWindowScene.h"
#include "session/ToolPanelWindowController.h"

#include <QPointer>

#include <memory>
#include <utility>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Window;

constexpr auto missing = "Warning: ToolPanelWindowController not created!\n";

class DrawingWindowMembers : public SessionFixture
{
protected:
    DrawingWindowMembers()
        : m_controller(loaded())
    { }

    /// A controller as its scene loads it, before a kind was chosen.
    static std::unique_ptr<DrawingWindowController> loaded()
    {
        auto object = makeDrawingWindowScene();
        auto *const controller = dynamic_cast<DrawingWindowController *>(object.get());
        static_cast<void>(object.release());
        return std::unique_ptr<DrawingWindowController>(controller);
    }

    /// What is printed while the window is set up as `type`.
    std::string printedAs(WindowType type, QSize image = { 400, 300 })
    {
        testing::internal::CaptureStdout();
        m_controller->createWindowForApplication(
            type, *primary(), QImage(image, QImage::Format_RGB32), std::nullopt);
        return testing::internal::GetCapturedStdout();
    }

    Penwick m_penwick;
    std::unique_ptr<DrawingWindowController> m_controller;
};

/// Counts how often its window closes.
class ClosingDelegate final : public QObject, public platform::WindowDelegate
{
public:
    void windowWillClose() override { ++m_closes; }
    [[nodiscard]] int closes() const { return m_closes; }

private:
    int m_closes = 0;
};

} // namespace

TEST_F(DrawingWindowMembers, controllerOfAWindowFromElsewhereHasNothingElse)
{
    auto window = std::make_unique<Window>();
    window->setWindowTitle(QStringLiteral("Elsewhere"));
    const Window *const taken = window.get();

    const DrawingWindowController controller(std::move(window));

    EXPECT_EQ(controller.window(), taken);
    EXPECT_EQ(contentOf(*taken).responder(), &controller);
    EXPECT_EQ(taken->windowTitle(), QStringLiteral("Elsewhere")) << "it was not loaded";
    EXPECT_EQ(controller.drawingWindow(), nullptr);
    EXPECT_EQ(controller.drawingWindowOrigin(), std::nullopt);
    EXPECT_EQ(controller.tPanelWindowController(), nullptr);
    EXPECT_EQ(controller.sharingNotificationWindow(), nullptr);
    EXPECT_EQ(controller.mWindowType(), std::nullopt);
    EXPECT_EQ(controller.minWindowWidth(), 1280.0);
    EXPECT_EQ(controller.minWindowHeight(), 720.0);
}

TEST_F(DrawingWindowMembers, originThatIsSetIsWhereWindowsArePlacedFrom)
{
    Window window;
    window.setFrame({ 0, 0, 30, 40 });

    m_controller->setDrawingWindowOrigin(Point { 100, 200 });
    m_controller->setWindowPositionRelativeToMainWindow(window, 1, 2);

    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 100, 200 }));
    EXPECT_EQ(window.frame(), (Rect { 101, 202, 30, 40 }));
    m_controller->setDrawingWindowOrigin(std::nullopt);
    EXPECT_EQ(m_controller->drawingWindowOrigin(), std::nullopt);
}

TEST_F(DrawingWindowMembers, typeThatIsSetDecidesHowTheEndIsTold)
{
    m_controller->setMWindowType(WindowType::imageAnnotation);
    EXPECT_EQ(m_controller->mWindowType(), WindowType::imageAnnotation);

    m_controller->windowWillClose();
    m_controller->setMWindowType(std::nullopt);
    m_controller->windowWillClose();

    EXPECT_EQ(m_controller->mWindowType(), std::nullopt);
    EXPECT_EQ(ends(), (std::vector<QVariant> { true, false }));
}

TEST_F(DrawingWindowMembers, toolBarThatIsSetTakesTheFormersPlace)
{
    const std::weak_ptr<ToolPanelWindowController> former = m_controller->tPanelWindowController();
    const auto other = std::make_shared<ToolPanelWindowController>(std::make_unique<Window>());
    Window &panel = *other->window();
    panel.setFrame({ 0, 0, 10, 40 });
    m_controller->drawingWindow()->addChildWindow(panel);

    m_controller->setTPanelWindowController(other);

    EXPECT_TRUE(former.expired());
    EXPECT_EQ(m_controller->tPanelWindowController(), other);
    EXPECT_EQ(printedAs(WindowType::whiteboard), "");
    EXPECT_EQ(panel.frame(), (Rect { 340, 180 + 360 - 20, 10, 40 }));
    EXPECT_TRUE(panel.attributes().hasShadow);
}

TEST_F(DrawingWindowMembers, placementWithoutAToolBarSaysSoAndPlacesNothingMore)
{
    m_controller->setTPanelWindowController(nullptr);

    EXPECT_EQ(printedAs(WindowType::annotation), missing);
    EXPECT_EQ(printedAs(WindowType::imageAnnotation), missing);
    EXPECT_EQ(printedAs(WindowType::whiteboard), missing);
    EXPECT_EQ(m_controller->drawingWindow()->frame(), (Rect { 320, 180, 1280, 720 }));
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 320, 180 }));
}

TEST_F(DrawingWindowMembers, placementWithoutAPanelWindowSaysNothing)
{
    m_controller->setTPanelWindowController(std::make_shared<ToolPanelWindowController>());

    EXPECT_EQ(printedAs(WindowType::whiteboard), "");
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 320, 180 }));
}

TEST_F(DrawingWindowMembers, resizeWithoutAPanelWindowSaysSoAndRecordsNothing)
{
    static_cast<void>(printedAs(WindowType::whiteboard));
    m_controller->setTPanelWindowController(std::make_shared<ToolPanelWindowController>());
    m_controller->drawingWindow()->setFrame({ 400, 180, 1200, 720 });
    testing::internal::CaptureStdout();

    m_controller->windowDidResize();

    EXPECT_EQ(testing::internal::GetCapturedStdout(), missing);
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 320, 180 }));
}

TEST_F(DrawingWindowMembers, windowWithoutAToolBarIsShownAndClosed)
{
    for (const auto &none : { std::shared_ptr<ToolPanelWindowController>(),
             std::make_shared<ToolPanelWindowController>() }) {
        m_controller = loaded();
        static_cast<void>(printedAs(WindowType::whiteboard));
        m_controller->setTPanelWindowController(none);

        m_controller->showWindow(nullptr);
        m_controller->drawingWindow()->close();
        m_controller->showWindow(nullptr);
        EXPECT_TRUE(m_controller->drawingWindow()->isVisible());
    }
    EXPECT_EQ(ends(), (std::vector<QVariant> { false, false }));
}

TEST_F(DrawingWindowMembers, bannerThatIsNotThereIsNeitherPlacedNorShownNorClosed)
{
    m_controller->setSharingNotificationWindow(nullptr);
    EXPECT_EQ(m_controller->sharingNotificationWindow(), nullptr);

    EXPECT_EQ(printedAs(WindowType::whiteboard), "");
    m_controller->showSharingNotificationWindow();
    m_controller->closeSharingNotificationWindow();

    EXPECT_EQ(m_controller->drawingWindow()->childWindows().size(), 1U) << "the tool bar alone";
}

TEST_F(DrawingWindowMembers, bannerThatIsNotThereIsNotMissedByAWindowThatWasNotPlaced)
{
    m_controller->setSharingNotificationWindow(nullptr);
    m_controller->setDrawingWindow(nullptr);

    m_controller->showSharingNotificationWindow();
}

TEST_F(DrawingWindowMembers, bannerThatIsSetIsTheOneThatIsShownAndClosed)
{
    const auto banner = std::make_shared<Window>();
    banner->setFrame({ 0, 0, 100, 20 });
    const QPointer<Window> former = m_controller->sharingNotificationWindow().get();
    m_controller->setSharingNotificationWindow(banner);
    EXPECT_FALSE(former);
    static_cast<void>(printedAs(WindowType::whiteboard));
    m_controller->showWindow(nullptr);

    m_controller->showSharingNotificationWindow();

    EXPECT_TRUE(banner->isVisible());
    EXPECT_EQ(banner->frame(), (Rect { 320 + 640 - 50, 180 + 360 - 10, 100, 20 }));
    m_controller->closeSharingNotificationWindow();
    EXPECT_FALSE(banner->isVisible());
    EXPECT_EQ(m_controller->sharingNotificationWindow(), banner);
}

TEST_F(DrawingWindowMembers, bannerIsClosedAndNotOnlyHidden)
{
    static_cast<void>(printedAs(WindowType::whiteboard));
    m_controller->showWindow(nullptr);
    Window &banner = *m_controller->sharingNotificationWindow();
    ClosingDelegate delegate;
    banner.setDelegate(&delegate);
    m_controller->showSharingNotificationWindow();

    m_controller->closeSharingNotificationWindow();

    EXPECT_EQ(delegate.closes(), 1);
}

TEST_F(DrawingWindowMembers, onlyAWhiteboardsBannerIsCentredBeforeItIsShown)
{
    const Window &banner = *m_controller->sharingNotificationWindow();
    const Rect unplaced = banner.frame();
    ASSERT_NE(unplaced.origin(), (Point { 810, 510 }));

    for (const WindowType type : { WindowType::annotation, WindowType::imageAnnotation }) {
        static_cast<void>(printedAs(type));
        EXPECT_EQ(banner.frame(), unplaced);
        EXPECT_EQ(banner.attributes().animationBehavior, platform::AnimationBehavior::byDefault);
    }
    static_cast<void>(printedAs(WindowType::whiteboard));
    EXPECT_EQ(banner.frame().origin(), (Point { 810, 510 }));
    EXPECT_EQ(banner.attributes().animationBehavior, platform::AnimationBehavior::alertPanel);
}

TEST_F(DrawingWindowMembers, entryObjectHoldsTheControllerThatItIsGiven)
{
    const auto first = m_penwick.createDrawingWindowController(WindowType::whiteboard, primary());
    const auto other = m_penwick.createDrawingWindowController(WindowType::whiteboard, primary());

    m_penwick.setPenwickWindowController(first);
    EXPECT_EQ(m_penwick.penwickWindowController(), first);
    EXPECT_EQ(other.use_count(), 1);
    m_penwick.setPenwickWindowController(nullptr);

    EXPECT_EQ(m_penwick.penwickWindowController(), nullptr);
    m_penwick.showWindowSharingNotification(); // has nobody to ask
}

} // namespace penwick::test
