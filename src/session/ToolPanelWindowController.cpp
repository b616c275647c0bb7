// SPDX-License-Identifier: MIT
#include "session/ToolPanelWindowController.h"

#include "platform/foundation/FatalError.h"
#include "platform/foundation/OneShotTimer.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WindowFlags.h"
#include "platform/window/WorkArea.h"
#include "session/PanelClamp.h"
#include "toolpanel/ToolPanelViewController.h"

namespace penwick {

namespace {

using platform::require;

constexpr int settleTime = 200; // ms, between letting go of the panel and pulling it back

// The work area of the screen that the panel stands on, or at least its parent.
platform::Rect reachableBeside(const platform::Rect &parent, const platform::Rect &panel)
{
    const platform::Rect area = platform::workAreaFor(panel);
    return reachablePanel(
        panel, parent, panel.intersects(area) ? area : platform::workAreaFor(parent));
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
    return *require(dynamic_cast<ToolPanelViewController *>(
                        platform::contentOf(*panel).contentViewController()),
        "the panel's content is no tool bar");
}

void ToolPanelWindowController::windowDidLoad()
{
    WindowController::windowDidLoad();
    ToolBarPanelWindow &panel = *require(m_toolPanelWindow.data(), "the tool bar has no panel");
    platform::WindowAttributes attributes = panel.attributes();
    attributes.backgroundColor = Qt::transparent;
    attributes.isOpaque = false;
    attributes.collectionBehavior = platform::everywhere;
    attributes.titlebarAppearsTransparent = true;
    attributes.styleMask &= ~(platform::StyleMask::titled | platform::StyleMask::closable
        | platform::StyleMask::miniaturizable | platform::StyleMask::resizable);
    attributes.styleMask |= platform::StyleMask::fullSizeContentView;
    attributes.titleVisibility = platform::TitleVisibility::hidden;
    attributes.showsToolbarButton = false;
    attributes.isMovableByWindowBackground = true;
    attributes.sharingType = platform::SharingType::none;
    attributes.level = platform::WindowLevel::mainMenu;
    panel.setAttributes(attributes);
    panel.setDelegate(this);
}

void ToolPanelWindowController::adjustPosition()
{
    if (!m_toolPanelWindow || !m_toolPanelWindow->parentWindow())
        return;
    const platform::Rect parent = m_toolPanelWindow->parentWindow()->frame();
    m_toolPanelWindow->setFrame(
        inReachFrom(clampedPanel(ownPlace(), parent), parent), platform::Animate::Yes);
}

void ToolPanelWindowController::keepEndInReach()
{
    if (!m_toolPanelWindow || !m_toolPanelWindow->parentWindow())
        return;
    const platform::Rect parent = m_toolPanelWindow->parentWindow()->frame();
    const platform::Rect reachable = inReachFrom(ownPlace(), parent);
    if (!(reachable == m_toolPanelWindow->frame()))
        m_toolPanelWindow->setFrame(reachable);
}

void ToolPanelWindowController::takeItsPlace()
{
    m_displacement = {};
    keepEndInReach();
}

platform::Rect ToolPanelWindowController::ownPlace() const
{
    const platform::Rect frame = m_toolPanelWindow->frame();
    return { frame.x - m_displacement.x, frame.y - m_displacement.y, frame.width, frame.height };
}

platform::Rect ToolPanelWindowController::inReachFrom(
    const platform::Rect &place, const platform::Rect &parent)
{
    const platform::Rect reachable = reachableBeside(parent, place);
    m_displacement = reachable.origin() - place.origin();
    return reachable;
}

void ToolPanelWindowController::mouseDown()
{
    m_displacement = {}; // wherever it is dragged from here is its own place
    ToolPanelViewController &bar = content();
    require(bar.popoverW(), "the tool bar has no popover window");
    bar.hidePopover();
}

void ToolPanelWindowController::mouseUp()
{
    m_displacement = {}; // an earlier release may have adjusted it in the middle of this drag
    platform::callLater(*this, settleTime, &ToolPanelWindowController::adjustPosition);
}

// By the desktop's own means, which no press on the panel announces.
void ToolPanelWindowController::windowWillMove()
{
    m_displacement = {};
}

} // namespace penwick
