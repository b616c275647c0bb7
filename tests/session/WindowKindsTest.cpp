// SPDX-License-Identifier: MIT
// What each kind of drawing window is like, and the banner over it.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "platform/view/View.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"

#include <QElapsedTimer>
#include <QTest>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Window;
using platform::WindowAttributes;

class WindowKinds : public SessionFixture
{
protected:
    DrawingWindowController &open(WindowType type, QScreen *screen,
        const std::optional<QImage> &image = std::nullopt,
        const std::optional<QString> &title = std::nullopt)
    {
        m_controller = m_penwick.createDrawingWindowController(type, screen, image, title);
        return *m_controller;
    }

    [[nodiscard]] static platform::ImageView &imageViewOf(DrawingWindowController &controller)
    {
        return *dynamic_cast<DrawViewController &>(
            *contentOf(*controller.drawingWindow()).contentViewController())
                    .annotatedImageView();
    }

    Penwick &penwick() { return m_penwick; }

private:
    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

QImage picture(int width, int height)
{
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(Qt::yellow);
    return image;
}

} // namespace

TEST_F(WindowKinds, annotationCoversExactlyTheGivenScreen)
{
    DrawingWindowController &controller = open(WindowType::annotation, secondary());

    const WindowAttributes &attributes = controller.drawingWindow()->attributes();
    EXPECT_EQ(controller.drawingWindow()->frame(), (Rect { 1920, 160, 1280, 720 }));
    EXPECT_EQ(controller.drawingWindowOrigin(), (Point { 1920, 160 }));
    EXPECT_FALSE(attributes.ignoresMouseEvents);
    EXPECT_FALSE(attributes.isOpaque);
    EXPECT_EQ(attributes.backgroundColor, QColor(Qt::transparent));
    EXPECT_EQ(attributes.collectionBehavior.toInt(), 257U);
    EXPECT_EQ(attributes.styleMask.toInt(), 32768U | 1U);
    EXPECT_EQ(attributes.titleVisibility, platform::TitleVisibility::hidden);
    EXPECT_TRUE(attributes.titlebarAppearsTransparent);
    EXPECT_FALSE(attributes.hasShadow);
    EXPECT_EQ(attributes.level, platform::WindowLevel::mainMenu);
    EXPECT_EQ(contentOf(*controller.drawingWindow()).contentView()->layer()->borderWidth, 0.0);
}

TEST_F(WindowKinds, toolBarStandsTwentyPointsInsideTheAnnotation)
{
    DrawingWindowController &controller = open(WindowType::annotation, primary());

    EXPECT_EQ(controller.tPanelWindowController()->toolPanelWindow()->frame(),
        (Rect { 20, 540 - 176, 52, 352 }));
}

TEST_F(WindowKinds, imageWindowsOuterFrameIsTheImagesSizeInPoints)
{
    QImage image = picture(800, 600);
    image.setDevicePixelRatio(2.0);

    DrawingWindowController &controller
        = open(WindowType::imageAnnotation, primary(), image, QStringLiteral("A frame"));

    EXPECT_EQ(controller.drawingWindow()->frame(), (Rect { 320, 180, 400, 300 }));
    EXPECT_EQ(controller.drawingWindow()->windowTitle(), QStringLiteral("A frame"));
    EXPECT_EQ(imageViewOf(controller).frame(), (Rect { 0, 0, 400, 300 }));
    EXPECT_EQ(imageViewOf(controller).image(), image);
    EXPECT_EQ(imageViewOf(controller).imageFrameStyle(), platform::ImageFrameStyle::Photo);
    EXPECT_EQ(contentOf(*controller.drawingWindow()).contentView()->layer()->borderWidth, 3.0);
}

TEST_F(WindowKinds, imageWindowWithoutATitleKeepsTheBoards)
{
    DrawingWindowController &controller
        = open(WindowType::imageAnnotation, primary(), picture(40, 30));

    EXPECT_EQ(controller.drawingWindow()->windowTitle(), QStringLiteral("Tarnhill Whiteboard"));
}

TEST_F(WindowKinds, imageWindowWithoutAnImageKeepsItsFrameAndGetsNoToolBar)
{
    for (const std::optional<QImage> &none : { std::optional<QImage>(), std::optional(QImage()) }) {
        DrawingWindowController &controller
            = open(WindowType::imageAnnotation, primary(), none, QStringLiteral("A frame"));
        controller.showWindow(nullptr);

        EXPECT_EQ(controller.drawingWindow()->frame(), (Rect { 320, 180, 1280, 720 }));
        EXPECT_EQ(controller.drawingWindowOrigin(), std::nullopt);
        EXPECT_FALSE(controller.tPanelWindowController()->toolPanelWindow()->isVisible());
        EXPECT_EQ(controller.drawingWindow()->windowTitle(), QStringLiteral("Tarnhill Whiteboard"));
    }
}

TEST_F(WindowKinds, onlyAnImageWindowEndsWithTrue)
{
    open(WindowType::imageAnnotation, primary(), picture(400, 300)).drawingWindow()->close();
    open(WindowType::annotation, primary()).drawingWindow()->close();

    EXPECT_EQ(ends(), (std::vector<QVariant> { true, false }));
}

TEST_F(WindowKinds, bannerBeforeAnyWindowDoesNothing)
{
    penwick().showWindowSharingNotification();

    EXPECT_EQ(penwick().penwickWindowController(), nullptr);
}

TEST_F(WindowKinds, bannerStandsInTheMiddleAndGoesAfterOneAndAHalfSeconds)
{
    DrawingWindowController &controller = open(WindowType::whiteboard, primary());
    Window &banner = *controller.sharingNotificationWindow();
    EXPECT_EQ(banner.frame(), (Rect { 810, 510, 300, 60 }));
    EXPECT_EQ(banner.attributes().animationBehavior, platform::AnimationBehavior::alertPanel);
    EXPECT_EQ(banner.attributes().sharingType, platform::SharingType::none);
    EXPECT_FALSE(banner.attributes().isOpaque);
    EXPECT_FALSE(banner.isVisible());
    controller.showWindow(nullptr);

    QElapsedTimer clock;
    clock.start();
    penwick().showWindowSharingNotification();

    EXPECT_TRUE(banner.isVisible());
    EXPECT_EQ(banner.parentWindow(), controller.drawingWindow());
    EXPECT_TRUE(QTest::qWaitFor([&banner] { return !banner.isVisible(); }));
    EXPECT_GE(clock.elapsed(), 1400); // a coarse timer may come a little early
    EXPECT_EQ(controller.sharingNotificationWindow().get(), &banner);
}

TEST_F(WindowKinds, bannerAskedForTwiceIsCentredAgain)
{
    DrawingWindowController &controller = open(WindowType::whiteboard, primary());
    controller.showWindow(nullptr);
    penwick().showWindowSharingNotification();
    controller.sharingNotificationWindow()->setFrameOrigin({ 0, 0 });

    penwick().showWindowSharingNotification();

    EXPECT_EQ(controller.sharingNotificationWindow()->frame(), (Rect { 810, 510, 300, 60 }));
    EXPECT_TRUE(controller.sharingNotificationWindow()->isVisible());
}

TEST_F(WindowKinds, bannersGroundIsTranslucentWithRoundCorners)
{
    DrawingWindowController &controller = open(WindowType::whiteboard, primary());

    const platform::Layer &layer
        = *contentOf(*controller.sharingNotificationWindow()).contentView()->layer();
    EXPECT_EQ(layer.backgroundColor.rgb(), qRgb(85, 85, 85));
    EXPECT_NEAR(layer.backgroundColor.alphaF(), 0.5, 0.001);
    EXPECT_EQ(layer.borderWidth, 0.0);
    EXPECT_EQ(layer.cornerRadius, 4.0);
}

} // namespace penwick::test
