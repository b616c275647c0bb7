// SPDX-License-Identifier: MIT
// The controller of all three popovers.
#pragma once

#include "canvas/ToolSelectionDelegate.h"
#include "platform/foundation/WeakReference.h"
#include "platform/view/ViewController.h"
#include "toolpanel/ToolPanelOptionDelegate.h"

#include <QPointer>

#include <memory>

namespace penwick {

class PopoverView;

namespace platform {
class Bundle;
class Button;
class Window;
} // namespace platform

/// Holds the three popovers of one interface file and turns a press on an option into the choice.
/// A popover that is hidden keeps its selection.
class PopoverViewController final : public platform::ViewController
{
    Q_OBJECT

public:
    /// Loads the interface called `nibName` of `bundle`; without it the process stops.
    PopoverViewController(const QString &nibName, const platform::Bundle &bundle);
    ~PopoverViewController() override;

    // Outlets; owned. Null until the interface has been loaded.
    [[nodiscard]] PopoverView *textPopoverView() const { return m_textPopoverView.get(); }
    [[nodiscard]] PopoverView *colorPopoverView() const { return m_colorPopoverView.get(); }
    [[nodiscard]] PopoverView *brushPopoverView() const { return m_brushPopoverView.get(); }
    /// Takes all three; each may be null. A popover closes when its view resigns first responder.
    void setPopoverViews(std::unique_ptr<PopoverView> text, std::unique_ptr<PopoverView> color,
        std::unique_ptr<PopoverView> brush);

    /// The window that shows the popovers; weak.
    [[nodiscard]] platform::Window *currentPopoverWindow() const;
    void setCurrentPopoverWindow(platform::Window *window);
    /// Who gets the chosen option; weak.
    void setToolPopoverDelegate(ToolSelectionDelegate *delegate);
    [[nodiscard]] ToolSelectionDelegate *toolPopoverDelegate() const;
    /// Who is told of another colour; weak.
    void setToolPanelOptionDelegate(ToolPanelOptionDelegate *delegate);
    [[nodiscard]] ToolPanelOptionDelegate *toolPanelOptionDelegate() const;

    /// The action of every option button. A sender that is none, or has no identifier, stops the
    /// process; an unknown kind of option is ignored.
    void OnToolOptionSelection(platform::Button &sender); // NOLINT: the name is fixed
    /// Closes the popover, and lets another view have the keys.
    bool resignFirstResponder() override;

private:
    void closePopover();

    std::unique_ptr<PopoverView> m_textPopoverView;
    std::unique_ptr<PopoverView> m_colorPopoverView;
    std::unique_ptr<PopoverView> m_brushPopoverView;
    QPointer<platform::Window> m_currentPopoverWindow;
    platform::WeakReference<ToolSelectionDelegate> m_toolPopoverDelegate;
    platform::WeakReference<ToolPanelOptionDelegate> m_toolPanelOptionDelegate;
};

} // namespace penwick
