// SPDX-License-Identifier: MIT
// A view controller, alone and as a window's content.
#include "platform/view/ViewController.h"

#include "platform/RecordingView.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

#include <gtest/gtest.h>

#include <memory>

namespace penwick::platform {

namespace {

/// Counts how often its view was loaded.
class CountingController final : public ViewController
{
public:
    void viewDidLoad() override
    {
        ++m_loads;
        EXPECT_NE(view(), nullptr);
    }

    [[nodiscard]] int loads() const { return m_loads; }

private:
    int m_loads = 0;
};

} // namespace

TEST(ViewController, viewIsLoadedOnceItIsSet)
{
    RecordingView view;
    CountingController controller;
    EXPECT_EQ(controller.view(), nullptr);

    controller.setView(view);

    EXPECT_EQ(controller.view(), &view);
    EXPECT_EQ(controller.loads(), 1);
}

TEST(ViewController, windowsContentIsTheViewOfItsContentController)
{
    Window window;
    auto *const view = new RecordingView(&window);
    auto controller = std::make_unique<ViewController>();
    controller->setView(*view);
    ViewController *const taken = controller.get();

    contentOf(window).setContentViewController(std::move(controller));

    EXPECT_EQ(contentOf(window).contentViewController(), taken);
    EXPECT_EQ(contentOf(window).contentView(), view);
}

} // namespace penwick::platform
