// SPDX-License-Identifier: MIT
// A controller and the window that lives as long as it does.
#include <penwick/platform/WindowController.h>

#include "platform/WindowFixture.h"
#include "platform/window/WindowContent.h"

#include <QPointer>

#include <memory>

namespace penwick::platform {

namespace {

/// Counts how often its window was loaded, and whether it was complete then.
class CountingController final : public WindowController
{
public:
    void windowDidLoad() override
    {
        ++m_loads;
        EXPECT_NE(window(), nullptr);
        EXPECT_EQ(contentOf(*window()).responder(), this);
    }

    [[nodiscard]] int loads() const { return m_loads; }

private:
    int m_loads = 0;
};

} // namespace

TEST(WindowController, windowIsLoadedOnceItIsSet)
{
    CountingController controller;
    EXPECT_EQ(controller.window(), nullptr);
    auto window = std::make_unique<Window>();
    Window *const taken = window.get();

    controller.setWindow(std::move(window));

    EXPECT_EQ(controller.window(), taken);
    EXPECT_EQ(controller.loads(), 1);
}

TEST(WindowController, windowFromElsewhereIsTakenWithoutBeingLoaded)
{
    auto window = std::make_unique<Window>();
    Window *const taken = window.get();

    const WindowController controller(std::move(window));

    EXPECT_EQ(controller.window(), taken);
    EXPECT_EQ(contentOf(*taken).responder(), &controller);
    EXPECT_EQ(WindowController(nullptr).window(), nullptr);
}

TEST(WindowController, windowThatTakesNoKeysIsShownWithoutAskingForThem)
{
    WindowController controller;
    controller.setWindow(std::make_unique<Window>(
        Rect { 0, 0, 40, 30 }, StyleMasks(), BackingStore::Buffered, false));
    controller.window()->winId();
    static QStringList warnings;
    warnings.clear();
    const auto former = qInstallMessageHandler(
        [](QtMsgType, const QMessageLogContext &, const QString &text) { warnings << text; });

    controller.showWindow(nullptr);

    qInstallMessageHandler(former);
    EXPECT_TRUE(controller.window()->isVisible());
    EXPECT_TRUE(warnings.filter(QStringLiteral("requestActivate")).isEmpty());
}

TEST(WindowController, shownWindowIsTheKeyWindow)
{
    WindowController controller;
    controller.setWindow(std::make_unique<Window>());
    EXPECT_FALSE(controller.window()->isVisible());

    controller.showWindow(nullptr);

    EXPECT_TRUE(controller.window()->isVisible());
    EXPECT_TRUE(QTest::qWaitFor([&] { return contentOf(*controller.window()).isKeyWindow(); }));
}

TEST(WindowController, controllerWithoutAWindowShowsNothing)
{
    WindowController controller;

    controller.showWindow(nullptr);
    controller.retire();

    EXPECT_EQ(controller.window(), nullptr);
}

TEST(WindowController, retiredWindowLeavesWithItsFamilyAndAnnouncesNothing)
{
    WindowController controller;
    controller.setWindow(std::make_unique<Window>());
    RecordingDelegate delegate;
    controller.window()->setDelegate(&delegate);
    controller.showWindow(nullptr);
    Window child;
    controller.window()->addChildWindow(child);
    ASSERT_TRUE(child.isVisible());

    controller.retire();

    EXPECT_FALSE(controller.window()->isVisible());
    EXPECT_FALSE(child.isVisible());
    EXPECT_EQ(delegate.take(), std::vector<std::string> {});
}

TEST(WindowController, windowGoesWithItsController)
{
    auto controller = std::make_unique<WindowController>();
    controller->setWindow(std::make_unique<Window>());
    controller->showWindow(nullptr);
    const QPointer<Window> window(controller->window());

    controller.reset();

    EXPECT_FALSE(window);
}

} // namespace penwick::platform
