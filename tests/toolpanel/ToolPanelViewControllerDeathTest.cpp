// SPDX-License-Identifier: MIT
// What a tool bar that is wired wrongly does: it stops the process, and says why.
#include "toolpanel/ToolPanelFixture.h"

#include "appearance/PenwickBundle.h"
#include "platform/scene/Bundle.h"
#include "platform/view/PlainView.h"
#include "session/ToolPanelScene.h"

#include <functional>

namespace penwick::test {

namespace {

class ToolPanelDeathTest : public ToolPanelFixture
{
protected:
    void expectStop(const char *reason, const std::function<void()> &action)
    {
        EXPECT_DEATH(action(), std::string("penwick: fatal error: ") + reason);
    }

    /// Shows another tool bar, child of `parent`.
    static void showStranger(platform::Window *parent)
    {
        const auto scene = makeToolPanelScene(*penwickBundle());
        auto &controller = dynamic_cast<ToolPanelWindowController &>(*scene);
        if (parent)
            parent->addChildWindow(*controller.toolPanelWindow());
        controller.showWindow(nullptr);
    }
};

constexpr auto missingOutlet = "an outlet of the tool panel is not connected";

using Outlet = QPointer<ToolPanelButton> ToolPanelOutlets::*;

class MissingOutletDeathTest : public ToolPanelFixture,
                               public testing::WithParamInterface<std::pair<const char *, Outlet>>
{ };

std::string outletName(const testing::TestParamInfo<std::pair<const char *, Outlet>> &outlet)
{
    return outlet.param.first;
}

} // namespace

TEST_F(ToolPanelDeathTest, buttonWithoutIdentifierStops)
{
    expectStop("a button of the tool panel has no identifier", [this] {
        ToolPanelButton nameless(platform::Rect { 0, 0, 32, 32 });
        bar.OnToolBarItemSelection(nameless);
    });
}

TEST_F(ToolPanelDeathTest, panelThatIsNoChildStops)
{
    expectStop("the tool panel belongs to no drawing window", [] { showStranger(nullptr); });
}

TEST_F(ToolPanelDeathTest, parentWithoutAControllerStops)
{
    expectStop("the drawing window has no controller", [] {
        platform::Window parent;
        parent.show();
        showStranger(&parent);
    });
}

TEST_F(ToolPanelDeathTest, parentWithAnotherContentStops)
{
    expectStop("the drawing window's content is no drawing", [] {
        auto window = std::make_unique<platform::Window>();
        platform::Window &parent = *window;
        platform::WindowController controller;
        controller.setWindow(std::move(window));
        parent.show();
        showStranger(&parent);
    });
}

TEST_F(ToolPanelDeathTest, pressWithoutADrawingStops)
{
    expectStop("the tool panel has no drawing to serve", [] {
        ToolPanelViewController controller;
        ToolPanelButton button(platform::Rect { 0, 0, 32, 32 });
        button.setIdentifier(QStringLiteral("text"));
        controller.OnToolBarItemSelection(button);
    });
}

TEST_F(ToolPanelDeathTest, pressForADelegateThatIsNoDrawingStops)
{
    class Listener final : public QObject, public ToolSelectionDelegate
    {
    public:
        void handleToolSelection(const QString &) override { }
        void handleToolOptionSelection(const QString &) override { }
    };
    expectStop("what the tool panel serves is no drawing", [this] {
        Listener listener;
        bar.setToolSelectionDelegate(&listener);
        press("brush");
    });
}

TEST_F(ToolPanelDeathTest, pressWithoutACanvasStops)
{
    expectStop("the tool panel's drawing has no canvas", [this] {
        drawViewController().setDrawingView(nullptr);
        press("text");
    });
}

TEST_F(ToolPanelDeathTest, missingHandleStops)
{
    expectStop(missingOutlet, [this] {
        bar.outlets().toolBarHandle = nullptr;
        bar.viewWillAppear();
    });
}

TEST_F(ToolPanelDeathTest, missingBodyStops)
{
    expectStop(missingOutlet, [this] {
        bar.outlets().toolPanelView = nullptr;
        bar.viewWillAppear();
    });
}

TEST_F(ToolPanelDeathTest, missingUndoButtonStopsTheHistorysNews)
{
    expectStop(missingOutlet, [this] {
        bar.outlets().undoButton = nullptr;
        post(QVariantMap { { QStringLiteral("enableUndo"), true } });
    });
}

TEST_F(ToolPanelDeathTest, missingColourButtonStopsANewColour)
{
    expectStop(missingOutlet, [this] {
        bar.outlets().colorButton = nullptr;
        choose("color#red");
    });
}

TEST_F(ToolPanelDeathTest, missingAnchorStopsThePopover)
{
    expectStop(missingOutlet, [this] {
        bar.outlets().brushButton = nullptr;
        press("brush");
    });
}

TEST_F(ToolPanelDeathTest, missingPopoverViewStopsThePopover)
{
    expectStop("a popover view is missing", [this] {
        bar.popoverVc()->setPopoverViews(nullptr, nullptr, nullptr);
        press("brush");
    });
}

TEST_F(ToolPanelDeathTest, missingPopoverViewStopsAChoice)
{
    expectStop("a popover view is missing", [this] {
        ToolOptionsButton choice(platform::Rect { 0, 0, 32, 32 });
        choice.setIdentifier(QStringLiteral("brush#8"));
        bar.popoverVc()->setPopoverViews(nullptr, nullptr, nullptr);
        bar.popoverVc()->OnToolOptionSelection(choice);
    });
}

TEST_F(ToolPanelDeathTest, optionSenderOfAnotherClassStops)
{
    expectStop("an option was chosen by no option button", [this] {
        ToolPanelButton stranger(platform::Rect { 0, 0, 32, 32 });
        stranger.setIdentifier(QStringLiteral("brush#8"));
        bar.popoverVc()->OnToolOptionSelection(stranger);
    });
}

TEST_F(ToolPanelDeathTest, optionWithoutIdentifierStops)
{
    expectStop("an option button has no identifier", [this] {
        ToolOptionsButton nameless(platform::Rect { 0, 0, 32, 32 });
        bar.popoverVc()->OnToolOptionSelection(nameless);
    });
}

TEST_F(ToolPanelDeathTest, missingInterfaceStops)
{
    expectStop("the popovers' interface file is missing", [] {
        const platform::Bundle empty(QStringLiteral(":/penwick/images"));
        const PopoverViewController controller(QStringLiteral("CommonPopoverView"), empty);
    });
}

TEST_P(MissingOutletDeathTest, stopsWhenTheViewIsLoaded)
{
    const auto load = [this] {
        ToolPanelViewController controller;
        controller.outlets() = bar.outlets();
        controller.outlets().*GetParam().second = nullptr;
        controller.setView(*bar.view());
    };

    EXPECT_DEATH(load(), std::string("penwick: fatal error: ") + missingOutlet);
}

INSTANTIATE_TEST_SUITE_P(Outlets, MissingOutletDeathTest,
    testing::Values(std::pair("text", &ToolPanelOutlets::textButton),
        std::pair("brush", &ToolPanelOutlets::brushButton),
        std::pair("eraser", &ToolPanelOutlets::eraserButton),
        std::pair("color", &ToolPanelOutlets::colorButton),
        std::pair("clear", &ToolPanelOutlets::clearButton),
        std::pair("state", &ToolPanelOutlets::stateButton),
        std::pair("redo", &ToolPanelOutlets::redoButton),
        std::pair("undo", &ToolPanelOutlets::undoButton)),
    outletName);

} // namespace penwick::test
