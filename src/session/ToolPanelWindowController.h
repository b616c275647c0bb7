// SPDX-License-Identifier: MIT
// The controller of the tool bar's window.
#pragma once

#include "session/ToolBarPanelWindow.h"

#include <penwick/platform/WindowController.h>

#include <QPointer>

#include <memory>
#include <utility>

namespace penwick {

class ToolPanelViewController;

/// Sets the panel up, lets it be dragged by its background and pulls it back inside its parent
/// window after every drag.
class ToolPanelWindowController final : public platform::WindowController,
                                        public platform::WindowDelegate
{
    Q_OBJECT

public:
    ToolPanelWindowController();
    /// A controller of a window that did not come from the scene. The window is not set up, and is
    /// not the panel until setToolPanelWindow() is called with it.
    explicit ToolPanelWindowController(std::unique_ptr<platform::Window> window);
    ~ToolPanelWindowController() override;

    /// The panel; the scene connects it. Weak.
    [[nodiscard]] ToolBarPanelWindow *toolPanelWindow() const { return m_toolPanelWindow; }
    void setToolPanelWindow(ToolBarPanelWindow *window) { m_toolPanelWindow = window; }
    /// A place to keep the popovers' window, which is not used; null at first. Owned.
    [[nodiscard]] const std::shared_ptr<platform::Window> &popoverWindow() const
    {
        return m_popoverWindow;
    }
    void setPopoverWindow(std::shared_ptr<platform::Window> window)
    {
        m_popoverWindow = std::move(window);
    }
    /// The content's controller; a panel without one stops the process.
    [[nodiscard]] ToolPanelViewController &content() const;

    void windowDidLoad() override;
    /// Glides the panel into its parent's frame; does nothing without a parent.
    void adjustPosition();
    /// Moves a panel that is higher than its parent has room for so that its lower end, which ends
    /// the session, is on the screen; at once. It comes back to its own place as its parent does.
    void keepEndInReach();
    /// The same for a panel that was put where it stands: that is its own place from now on.
    void takeItsPlace();
    void mouseDown() override;
    void mouseUp() override;
    void windowWillMove() override;

private:
    [[nodiscard]] platform::Rect ownPlace() const;
    [[nodiscard]] platform::Rect inReachFrom(
        const platform::Rect &place, const platform::Rect &parent);

    QPointer<ToolBarPanelWindow> m_toolPanelWindow;
    // By how much the panel stands away from where the user or the window has put it, so that the
    // button that ends the session can be reached.
    platform::Point m_displacement;
    std::shared_ptr<platform::Window> m_popoverWindow;
};

} // namespace penwick
