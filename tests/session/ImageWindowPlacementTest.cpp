// SPDX-License-Identifier: MIT
// The window over an image: its frame, and how large the picture is in it.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "platform/view/View.h"
#include "platform/window/WindowContent.h"
#include "session/PictureFit.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QTest>

#include <cmath>
#include <memory>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Size;
using platform::Window;

class ImageWindowPlacement : public SessionFixture
{
protected:
    Window &open(QSize size, QScreen *screen = primary())
    {
        QImage image(size, QImage::Format_RGB32);
        image.fill(Qt::yellow);
        m_controller = m_penwick.createDrawingWindowController(
            WindowType::imageAnnotation, screen, image, std::nullopt);
        return *m_controller->drawingWindow();
    }

    /// Puts the window on the screen and waits until the desktop has answered.
    void show()
    {
        m_controller->showWindow(nullptr);
        ASSERT_TRUE(QTest::qWaitForWindowExposed(m_controller->drawingWindow()));
        ASSERT_TRUE(QTest::qWaitFor([this] { return !imageView().findChild<PictureFit *>(); }));
        deleteWhatIsLeft();
    }

    [[nodiscard]] platform::ImageView &imageView() const
    {
        return *dynamic_cast<DrawViewController &>(
            *contentOf(*m_controller->drawingWindow()).contentViewController())
                    .annotatedImageView();
    }
    [[nodiscard]] const Window &panel() const
    {
        return *m_controller->tPanelWindowController()->window();
    }
    [[nodiscard]] Size content() const
    {
        const QSize size = m_controller->drawingWindow()->size();
        return { static_cast<double>(size.width()), static_cast<double>(size.height()) };
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

} // namespace

TEST_F(ImageWindowPlacement, frameIsTheImagesUntilTheWindowIsShown)
{
    const Window &window = open({ 4000, 3000 });

    EXPECT_EQ(window.frame(), (Rect { 320, 180, 4000, 3000 }));
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 320, 180 }));
    EXPECT_EQ(imageView().frame(), (Rect { 0, 0, 4000, 3000 }));
}

TEST_F(ImageWindowPlacement, imageThatFitsKeepsItsFrame)
{
    const Window &window = open({ 800, 600 });

    show();

    EXPECT_EQ(window.frame(), (Rect { 320, 180, 800, 600 }));
    EXPECT_EQ(panel().frame(), (Rect { 340, 180 + 300 - 176, 52, 352 }));
}

TEST_F(ImageWindowPlacement, imageLargerThanTheScreenIsBroughtInsideInItsOwnShape)
{
    const Window &window = open({ 4000, 3000 });

    show();

    EXPECT_EQ(window.frame(), (Rect { 320, 0, 1440, 1080 }));
    EXPECT_EQ(m_controller->drawingWindowOrigin(), (Point { 320, 0 }));
    EXPECT_EQ(panel().frame(), (Rect { 340, 540 - 176, 52, 352 })) << "beside the shown window";
}

TEST_F(ImageWindowPlacement, imageAsLargeAsTheScreenOnlyMoves)
{
    const Window &window = open({ 1920, 1080 });

    show();

    EXPECT_EQ(window.frame(), (Rect { 0, 0, 1920, 1080 }));
}

TEST_F(ImageWindowPlacement, isBroughtInsideTheScreenThatItWasGiven)
{
    const Window &window = open({ 2560, 720 }, secondary());

    show();

    EXPECT_EQ(window.frame(), (Rect { 1920, 280, 1280, 360 }));
}

TEST_F(ImageWindowPlacement, bannerThatWasAskedForBeforeIsInTheMiddleOfTheShownWindow)
{
    static_cast<void>(open({ 4000, 3000 }));
    m_penwick.showWindowSharingNotification();

    show();

    EXPECT_TRUE(m_controller->sharingNotificationWindow()->isVisible());
    EXPECT_EQ(m_controller->sharingNotificationWindow()->frame(),
        (Rect { 320 + 720 - 150, 540 - 30, 300, 60 }));
}

TEST_F(ImageWindowPlacement, windowThatIsShownAgainIsBroughtInsideAgain)
{
    Window &window = open({ 800, 600 });
    show();
    window.setFrameOrigin({ 1500, -200 });
    ASSERT_TRUE(QTest::qWaitFor([this] { return panel().frame().x == 1520; }));
    Window &popover = *m_controller->tPanelWindowController()->content().popoverW();
    m_controller->tPanelWindowController()->content().button(QStringLiteral("color"))->click();
    ASSERT_TRUE(popover.isVisible());
    window.hide();

    m_controller->showWindow(nullptr);

    EXPECT_EQ(window.frame(), (Rect { 1120, 0, 800, 600 }));
    EXPECT_EQ(panel().frame(), (Rect { 1140, 300 - 176, 52, 352 })) << "it has followed";
    EXPECT_FALSE(popover.isVisible()) << "its button is elsewhere";
}

TEST_F(ImageWindowPlacement, boardsAndLayersAreLeftWhereTheyArePlaced)
{
    for (const WindowType type : { WindowType::whiteboard, WindowType::annotation }) {
        m_controller = m_penwick.createDrawingWindowController(type, primary());
        Window &window = *m_controller->drawingWindow();
        window.setFrame({ 1500, -200, 800, 450 });

        m_controller->showWindow(nullptr);

        EXPECT_EQ(window.frame(), (Rect { 1500, -200, 800, 450 }));
    }
}

TEST_F(ImageWindowPlacement, pictureIsScaledDownToWhatTheContentHolds)
{
    static_cast<void>(open({ 800, 600 }));

    show();

    ASSERT_LT(content().height, 600) << "there is a title bar";
    const double scale = content().height / 600;
    EXPECT_EQ(imageView().frame(), (Rect { 0, 0, std::round(800 * scale), content().height }));
}

TEST_F(ImageWindowPlacement, pictureKeepsItsScaleWhenTheWindowIsResizedLater)
{
    Window &window = open({ 800, 600 });
    show();
    const Rect before = imageView().frame();

    for (const Rect &frame : { Rect { 320, 180, 1600, 900 }, Rect { 320, 180, 400, 300 } }) {
        window.setFrame(frame);
        ASSERT_TRUE(QTest::qWaitFor([&] { return window.frameGeometry().width() == frame.width; }));
        QCoreApplication::processEvents();
        EXPECT_EQ(imageView().frame(), before);
    }
}

TEST_F(ImageWindowPlacement, everyImageIsFittedOnce)
{
    Window &window = open({ 800, 600 });
    show();
    QImage other(400, 1000, QImage::Format_RGB32);
    other.fill(Qt::red);

    m_controller->createWindowForApplication(
        WindowType::imageAnnotation, *primary(), other, std::nullopt);
    ASSERT_TRUE(QTest::qWaitFor([this] { return !imageView().findChild<PictureFit *>(); }));

    EXPECT_EQ(window.frame(), (Rect { 320, 80, 400, 1000 })) << "it is on the screen";
    EXPECT_LT(content().width, 400);
    EXPECT_EQ(imageView().frame(),
        (Rect { 0, 0, content().width, std::round(1000 * content().width / 400) }));
}

} // namespace penwick::test
