// SPDX-License-Identifier: MIT
// What a tool bar without what it belongs to, or without its resources, does: it stops the process.
#include "toolpanel/ToolPanelFixture.h"

#include "appearance/PenwickBundle.h"
#include "platform/scene/Bundle.h"
#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelScene.h"
#include "toolpanel/PopoverInterface.h"

namespace penwick::test {

namespace {

class ToolPanelWiringDeathTest : public ToolPanelFixture
{ };

} // namespace

TEST_F(ToolPanelWiringDeathTest, parentWhoseControllerHasNoWindowStops)
{
    const auto show = [] {
        platform::WindowController controller;
        platform::Window parent;
        contentOf(parent).setResponder(&controller);
        parent.show();
        const auto scene = makeToolPanelScene(*penwickBundle());
        auto &stranger = dynamic_cast<ToolPanelWindowController &>(*scene);
        parent.addChildWindow(*stranger.toolPanelWindow());
        stranger.showWindow(nullptr);
    };

    EXPECT_DEATH(show(), "penwick: fatal error: the drawing window's controller has no window");
}

TEST_F(ToolPanelWiringDeathTest, appearingBeforeItWasLoadedStops)
{
    ToolPanelViewController controller;

    EXPECT_DEATH(
        controller.viewWillAppear(), "penwick: fatal error: the tool panel has no popovers");
}

TEST_F(ToolPanelWiringDeathTest, appearingOutsideAWindowStops)
{
    const auto appear = [this] {
        ToolPanelViewController controller;
        controller.outlets() = bar.outlets();
        platform::PlainView lone;
        controller.setView(lone);
        controller.viewWillAppear();
    };

    EXPECT_DEATH(appear(), "penwick: fatal error: the tool panel is in no window");
}

TEST_F(ToolPanelWiringDeathTest, loadingOrANewColourWithoutResourcesStops)
{
    setPenwickBundle(nullptr);
    const auto load = [this] {
        ToolPanelViewController controller;
        controller.outlets() = bar.outlets();
        controller.setView(*bar.view());
    };

    EXPECT_DEATH(load(), "penwick: fatal error: the resource bundle is not set");
    EXPECT_DEATH(bar.changeColorToolImage(QStringLiteral("color#red")),
        "penwick: fatal error: the resource bundle is not set");
}

TEST_F(ToolPanelWiringDeathTest, popoversWithoutAViewStop)
{
    const auto bundle = std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images"));
    bundle->addInterface(QStringLiteral("CommonPopoverView"), [](QObject &) {});
    setPenwickBundle(bundle);
    const auto load = [this] {
        ToolPanelViewController controller;
        controller.outlets() = bar.outlets();
        controller.setView(*bar.view());
    };

    EXPECT_DEATH(load(), "penwick: fatal error: the popovers have no view");
}

TEST_F(ToolPanelWiringDeathTest, popoversOfAnybodyElseStop)
{
    QObject somebody;

    EXPECT_DEATH(loadPopoverInterface(somebody, *penwickBundle()),
        "penwick: fatal error: the popovers' interface belongs to a popover view controller");
}

} // namespace penwick::test
