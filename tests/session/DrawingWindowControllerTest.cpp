// SPDX-License-Identifier: MIT
// The white board's window: where it is put and what it looks like.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"
#include "session/DrawingWindowScene.h"

#include <QTest>
#include <QTranslator>

#include <memory>

namespace penwick::test {

namespace {

using platform::Point;
using platform::Rect;
using platform::Window;

class DrawingWindow : public SessionFixture
{
protected:
    std::shared_ptr<DrawingWindowController> opened(QScreen *screen)
    {
        return m_penwick.createDrawingWindowController(WindowType::whiteboard, screen);
    }

    /// A controller as its scene loads it, before a kind was chosen.
    static std::unique_ptr<DrawingWindowController> loaded()
    {
        auto object = makeDrawingWindowScene();
        auto *const controller = dynamic_cast<DrawingWindowController *>(object.get());
        static_cast<void>(object.release());
        return std::unique_ptr<DrawingWindowController>(controller);
    }

    static Rect contentOf(const Window &window)
    {
        return { 0.0, 0.0, static_cast<double>(window.width()),
            static_cast<double>(window.height()) };
    }

    Penwick m_penwick;
};

using DrawingWindowDeathTest = DrawingWindow;

/// The host's words for the title.
class TitleTranslator final : public QTranslator
{
public:
    [[nodiscard]] QString translate(
        const char *context, const char *sourceText, const char *, int) const override
    {
        // The title is the host's to word, so it is looked up without a context of ours.
        return qstrlen(context) == 0 && qstrcmp(sourceText, "Tarnhill Whiteboard") == 0
            ? QStringLiteral("Wandtafel")
            : QString();
    }
    [[nodiscard]] bool isEmpty() const override { return false; }
};

} // namespace

TEST_F(DrawingWindow, newControllerKnowsTheMainScreensTwoThirds)
{
    const DrawingWindowController controller;

    EXPECT_EQ(controller.minWindowWidth(), 1280.0);
    EXPECT_EQ(controller.minWindowHeight(), 720.0);
    EXPECT_EQ(controller.drawingWindowOrigin(), std::nullopt);
    EXPECT_EQ(controller.mWindowType(), std::nullopt);
    EXPECT_EQ(controller.drawingWindow(), nullptr);
}

TEST_F(DrawingWindow, loadedWindowStandsOnTheMainScreen)
{
    const auto controller = loaded();

    ASSERT_NE(controller->drawingWindow(), nullptr);
    EXPECT_EQ(controller->window(), controller->drawingWindow());
    EXPECT_EQ(controller->drawingWindow()->frame(), (Rect { 320.0, 180.0, 1280.0, 720.0 }));
    EXPECT_EQ(controller->drawingWindowOrigin(), std::nullopt);
    EXPECT_EQ(controller->mWindowType(), std::nullopt);
}

TEST_F(DrawingWindow, loadedWindowHasItsAttributes)
{
    const auto controller = loaded();
    const platform::WindowAttributes &attributes = controller->drawingWindow()->attributes();

    EXPECT_EQ(attributes.backgroundColor, QColor(Qt::white));
    EXPECT_EQ((attributes.styleMask & platform::StyleMask::resizable).toInt(), 8U);
    EXPECT_EQ((attributes.styleMask & platform::StyleMask::titled).toInt(), 1U);
    EXPECT_EQ((attributes.styleMask & platform::StyleMask::closable).toInt(), 2U);
    EXPECT_TRUE(attributes.hasShadow);
    EXPECT_EQ(attributes.aspectRatio, (platform::Size { 16.0, 9.0 }));
    EXPECT_EQ(attributes.level, platform::WindowLevel::normal);
}

TEST_F(DrawingWindow, titleIsTheKeyWithoutATranslation)
{
    EXPECT_EQ(loaded()->drawingWindow()->windowTitle(), QStringLiteral("Tarnhill Whiteboard"));
}

TEST_F(DrawingWindow, titleIsTheHostsTranslation)
{
    TitleTranslator translator;
    QCoreApplication::installTranslator(&translator);

    EXPECT_EQ(loaded()->drawingWindow()->windowTitle(), QStringLiteral("Wandtafel"));

    QCoreApplication::removeTranslator(&translator);
}

TEST_F(DrawingWindow, hostsTitleIsNotForAWhiteboard)
{
    const auto controller = m_penwick.createDrawingWindowController(
        WindowType::whiteboard, primary(), std::nullopt, QStringLiteral("Mine"));

    EXPECT_EQ(controller->window()->windowTitle(), QStringLiteral("Tarnhill Whiteboard"));
}

TEST_F(DrawingWindow, whiteboardIsASixteenToNineBoxInsideItsScreen)
{
    const auto controller = opened(primary());

    EXPECT_EQ(controller->window()->frame(), (Rect { 320.0, 180.0, 1280.0, 720.0 }));
    EXPECT_EQ(controller->drawingWindowOrigin(), (Point { 320.0, 180.0 }));
    EXPECT_EQ(controller->mWindowType(), WindowType::whiteboard);
}

TEST_F(DrawingWindow, whiteboardStandsOnTheScreenThatItWasGiven)
{
    const auto controller = opened(secondary());

    const double width = 1280.0 * 2 / 3;
    EXPECT_EQ(controller->minWindowWidth(), width);
    EXPECT_EQ(controller->minWindowHeight(), 480.0);
    EXPECT_EQ(controller->window()->frame(),
        (Rect { 1920.0 + 1280.0 / 6, 160.0 + 120.0, width, width * 9 * 0.0625 }));
    EXPECT_EQ(controller->drawingWindowOrigin(), (Point { 1920.0 + 1280.0 / 6, 280.0 }));
}

TEST_F(DrawingWindow, shownWhiteboardIsWhereItWasPlaced)
{
    const auto controller = opened(primary());

    controller->showWindow(nullptr);

    ASSERT_TRUE(QTest::qWaitForWindowExposed(controller->window()));
    EXPECT_TRUE(QTest::qWaitFor([&] {
        return controller->window()->frameGeometry() == QRect(320, 1080 - 900, 1280, 720);
    }));
    EXPECT_EQ(controller->window()->frame(), (Rect { 320.0, 180.0, 1280.0, 720.0 }));
    EXPECT_EQ(controller->drawingWindowOrigin(), (Point { 320.0, 180.0 }));
}

TEST_F(DrawingWindow, originIsRecordedAnewAfterAMove)
{
    const auto controller = opened(primary());
    controller->showWindow(nullptr);
    ASSERT_TRUE(QTest::qWaitForWindowExposed(controller->window()));

    controller->window()->setFrameOrigin({ 400.0, 250.0 });

    EXPECT_TRUE(QTest::qWaitFor([&] {
        return controller->drawingWindowOrigin() == (Point { 400.0, 250.0 });
    }));
}

TEST_F(DrawingWindow, canvasFillsTheWindowAndHasAGreenBorder)
{
    const auto controller = opened(primary());
    controller->showWindow(nullptr);
    ASSERT_TRUE(QTest::qWaitForWindowExposed(controller->window()));

    auto *const canvas = dynamic_cast<DrawingCanvasView *>(
        platform::contentOf(*controller->window()).contentView());
    ASSERT_NE(canvas, nullptr);
    EXPECT_EQ(canvas->frame(), contentOf(*controller->window()));
    ASSERT_NE(canvas->layer(), nullptr);
    EXPECT_EQ(canvas->layer()->borderColor.rgb(), QColor(0, 255, 0).rgb());
    EXPECT_NEAR(canvas->layer()->borderColor.alphaF(), 0.3, 1.0 / 65535);
    EXPECT_EQ(canvas->layer()->borderWidth, 3.0);
    EXPECT_EQ(canvas->layer()->cornerRadius, 0.0);
}

TEST_F(DrawingWindow, imageLiesUnderTheCanvasAndIsNotOneOfItsSubviews)
{
    const auto controller = loaded();
    auto *const content = dynamic_cast<DrawViewController *>(
        platform::contentOf(*controller->drawingWindow()).contentViewController());
    ASSERT_NE(content, nullptr);
    const QObjectList children = controller->drawingWindow()->children();

    ASSERT_NE(content->annotatedImageView(), nullptr);
    EXPECT_EQ(
        content->drawingView(), platform::contentOf(*controller->drawingWindow()).contentView());
    EXPECT_LT(
        children.indexOf(content->annotatedImageView()), children.indexOf(content->drawingView()));
    EXPECT_TRUE(content->drawingView()->subviews().empty());
}

TEST_F(DrawingWindowDeathTest, windowThatIsGoneStopsTheProcess)
{
    const auto controller = loaded();
    controller->setDrawingWindow(nullptr);

    EXPECT_DEATH(controller->createWindowForApplication(
                     WindowType::whiteboard, *primary(), std::nullopt, std::nullopt),
        "penwick: fatal error: the drawing window is gone");
}

} // namespace penwick::test
