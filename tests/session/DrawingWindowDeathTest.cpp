// SPDX-License-Identifier: MIT
// What a drawing window that is wired wrongly, or asked too early, does: it stops the process.
#include "session/SessionFixture.h"

#include "appearance/PenwickBundle.h"
#include "platform/scene/Bundle.h"
#include "platform/view/ViewController.h"
#include "platform/window/WindowContent.h"
#include "session/DrawingWindowScene.h"
#include "session/ToolPanelScene.h"

#include <QImage>

#include <memory>

namespace penwick::test {

namespace {

class DrawingWindowStopDeathTest : public SessionFixture
{
protected:
    DrawingWindowStopDeathTest()
        : m_controller(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()))
    { }

    [[nodiscard]] platform::Window &window() const { return *m_controller->drawingWindow(); }

    void reopenAs(WindowType type)
    {
        m_controller->createWindowForApplication(
            type, *primary(), QImage(40, 30, QImage::Format_RGB32), std::nullopt);
    }

    /// The component's own resources but for the banner's scene, which is `maker`'s.
    static void useBanner(const platform::Bundle::SceneMaker &maker)
    {
        auto bundle = std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images"));
        const QString main = QStringLiteral("Main");
        bundle->addScene(main, QStringLiteral("DrawingWindowController"), makeDrawingWindowScene);
        if (maker)
            bundle->addScene(main, QStringLiteral("SharingNotificationWindowController"), maker);
        setPenwickBundle(std::move(bundle));
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

} // namespace

TEST_F(DrawingWindowStopDeathTest, missingBannerSceneStopsTheProcess)
{
    useBanner({});

    EXPECT_DEATH(static_cast<void>(makeDrawingWindowScene()), "penwick: fatal error: ");
}

TEST_F(DrawingWindowStopDeathTest, bannerSceneOfAnotherClassStopsTheProcess)
{
    useBanner([] { return std::make_unique<QObject>(); });

    EXPECT_DEATH(static_cast<void>(makeDrawingWindowScene()),
        "penwick: fatal error: the drawing window has no sharing banner");
}

TEST_F(DrawingWindowStopDeathTest, loadingWithoutResourcesStopsTheProcess)
{
    setPenwickBundle(nullptr);

    EXPECT_DEATH(static_cast<void>(makeDrawingWindowScene()),
        "penwick: fatal error: the resource bundle is not set");
    EXPECT_DEATH(m_penwick.createDrawingWindowController(WindowType::whiteboard, primary()),
        "penwick: fatal error: the resource bundle is not set");
}

TEST_F(DrawingWindowStopDeathTest, boardWithoutACanvasStopsTheProcess)
{
    contentOf(window()).setContentView(nullptr);

    EXPECT_DEATH(reopenAs(WindowType::whiteboard),
        "penwick: fatal error: the drawing window has no content view");
}

TEST_F(DrawingWindowStopDeathTest, imageForAnotherContentStopsTheProcess)
{
    platform::View *const canvas = contentOf(window()).contentView();
    contentOf(window()).setContentViewController(nullptr);
    ASSERT_EQ(contentOf(window()).contentView(), canvas);

    EXPECT_DEATH(reopenAs(WindowType::imageAnnotation),
        "penwick: fatal error: the drawing window's content is no drawing");
}

TEST_F(DrawingWindowStopDeathTest, bannerOverAWindowThatIsGoneStopsTheProcess)
{
    m_controller->setDrawingWindow(nullptr);

    EXPECT_DEATH(m_penwick.showWindowSharingNotification(),
        "penwick: fatal error: the drawing window is gone");
}

TEST_F(DrawingWindowStopDeathTest, bannerOverAnImageWindowThatHasNoImageStopsTheProcess)
{
    const auto board
        = m_penwick.createDrawingWindowController(WindowType::imageAnnotation, primary());

    EXPECT_DEATH(m_penwick.showWindowSharingNotification(),
        "penwick: fatal error: the drawing window has not been placed");
}

} // namespace penwick::test
