// SPDX-License-Identifier: MIT
#include "session/ToolPanelWindowController.h"

#include "platform/foundation/FatalError.h"
#include "platform/foundation/OneShotTimer.h"
#include "platform/window/WindowFlags.h"
#include "platform/window/WorkArea.h"
#include "session/PanelClamp.h"
#include "toolpanel/ToolPanelViewController.h"

namespace penwick {

namespace {

using platform::require;

constexpr int settleTime = 200; // ms, between letting go of the panel and pulling it back
constexpr unsigned onAllDesktopsAndBesideFullScreen = 257;
constexpr int hiddenTitle = 1;

platform::Rect reachableBeside(const platform::Window &parent, const platform::Rect &panel)
{
    return reachablePanel(panel, parent.frame(), platform::workAreaFor(panel));
}

} // namespace

ToolPanelWindowController::ToolPanelWindowController() = default;
ToolPanelWindowController::~ToolPanelWindowController() = default;

ToolPanelWindowController::ToolPanelWindowController(std::unique_ptr<platform::Window> window)
    : WindowController(std::move(window))
{ }

ToolPanelViewController &ToolPanelWindowController::content() const
{
    const ToolBarPanelWindow *const panel
        = require(m_toolPanelWindow.data(), "the tool bar has no panel");
    return *require(dynamic_cast<ToolPanelViewController *>(panel->contentViewController()),
        "the panel's content is no tool bar");
}

void ToolPanelWindowController::windowDidLoad()
{
    WindowController::windowDidLoad();
    ToolBarPanelWindow &panel = *require(m_toolPanelWindow.data(), "the tool bar has no panel");
    platform::WindowAttributes attributes = panel.attributes();
    attributes.backgroundColor = Qt::transparent;
    attributes.isOpaque = false;
    attributes.collectionBehavior = onAllDesktopsAndBesideFullScreen;
    attributes.titlebarAppearsTransparent = true;
    attributes.styleMask &= ~(platform::StyleMask::titled | platform::StyleMask::closable
        | platform::StyleMask::miniaturizable | platform::StyleMask::resizable);
    attributes.styleMask |= platform::StyleMask::fullSizeContentView;
    attributes.titleVisibility = hiddenTitle;
    attributes.showsToolbarButton = false;
    attributes.isMovableByWindowBackground = true;
    attributes.sharingType = 0;
    attributes.level = platform::mainMenuWindowLevel;
    panel.setAttributes(attributes);
    panel.setDelegate(this);
}

void ToolPanelWindowController::adjustPosition()
{
    if (!m_toolPanelWindow)
        return;
    const platform::Window *const parent = m_toolPanelWindow->parentWindow();
    if (parent) {
        const platform::Rect clamped = clampedPanel(m_toolPanelWindow->frame(), parent->frame());
        m_toolPanelWindow->setFrame(reachableBeside(*parent, clamped), platform::Animate::Yes);
    }
}

void ToolPanelWindowController::keepEndInReach()
{
    if (!m_toolPanelWindow)
        return;
    const platform::Window *const parent = m_toolPanelWindow->parentWindow();
    const platform::Rect frame = m_toolPanelWindow->frame();
    const platform::Rect reachable = parent ? reachableBeside(*parent, frame) : frame;
    if (!(reachable == frame))
        m_toolPanelWindow->setFrame(reachable);
}

void ToolPanelWindowController::mouseDown()
{
    ToolPanelViewController &bar = content();
    require(bar.popoverW(), "the tool bar has no popover window");
    bar.hidePopover();
}

void ToolPanelWindowController::mouseUp()
{
    platform::callLater(*this, settleTime, &ToolPanelWindowController::adjustPosition);
}

} // namespace penwick
