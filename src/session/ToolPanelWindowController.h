// SPDX-License-Identifier: MIT
// The controller of the tool bar's window.
#pragma once

#include "session/ToolBarPanelWindow.h"

#include <penwick/platform/WindowController.h>

#include <QPointer>

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
    ~ToolPanelWindowController() override;

    /// The panel; the scene connects it. Weak.
    [[nodiscard]] ToolBarPanelWindow *toolPanelWindow() const { return m_toolPanelWindow; }
    void setToolPanelWindow(ToolBarPanelWindow *window) { m_toolPanelWindow = window; }
    /// The content's controller; a panel without one stops the process.
    [[nodiscard]] ToolPanelViewController &content() const;

    void windowDidLoad() override;
    /// Glides the panel inside its parent's frame; nothing without a parent.
    void adjustPosition();
    /// Moves a panel that is higher than its parent has room for so that its lower end, which ends
    /// the session, is on the screen; at once.
    void keepEndInReach();
    void mouseDown() override;
    void mouseUp() override;

private:
    QPointer<ToolBarPanelWindow> m_toolPanelWindow;
};

} // namespace penwick
