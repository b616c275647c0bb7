// SPDX-License-Identifier: MIT
#include "toolpanel/PopoverViewController.h"

#include "platform/foundation/FatalError.h"
#include "platform/scene/Bundle.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/ToolOptionsButton.h"

#include <penwick/platform/Window.h>

namespace penwick {

using platform::require;

PopoverViewController::PopoverViewController(const QString &nibName, const platform::Bundle &bundle)
{
    const platform::Bundle::InterfaceLoader load = bundle.interfaceLoader(nibName);
    if (!load)
        platform::fatalError("the popovers' interface file is missing");
    load(*this);
}

PopoverViewController::~PopoverViewController() = default;

void PopoverViewController::setPopoverViews(std::unique_ptr<PopoverView> text,
    std::unique_ptr<PopoverView> color, std::unique_ptr<PopoverView> brush)
{
    m_textPopoverView = std::move(text);
    m_colorPopoverView = std::move(color);
    m_brushPopoverView = std::move(brush);
    for (PopoverView *const view : { textPopoverView(), colorPopoverView(), brushPopoverView() }) {
        if (view)
            view->setNextResponder(this);
    }
}

platform::Window *PopoverViewController::currentPopoverWindow() const
{
    return m_currentPopoverWindow;
}

void PopoverViewController::setCurrentPopoverWindow(platform::Window *window)
{
    m_currentPopoverWindow = window;
}

void PopoverViewController::setToolPopoverDelegate(ToolSelectionDelegate *delegate)
{
    m_toolPopoverDelegate = delegate;
}

ToolSelectionDelegate *PopoverViewController::toolPopoverDelegate() const
{
    return m_toolPopoverDelegate.get();
}

void PopoverViewController::setToolPanelOptionDelegate(ToolPanelOptionDelegate *delegate)
{
    m_toolPanelOptionDelegate = delegate;
}

ToolPanelOptionDelegate *PopoverViewController::toolPanelOptionDelegate() const
{
    return m_toolPanelOptionDelegate.get();
}

void PopoverViewController::OnToolOptionSelection(platform::Button &sender)
{
    auto &option = *require(
        dynamic_cast<ToolOptionsButton *>(&sender), "an option was chosen by no option button");
    const QString identifier = option.identifier();
    if (identifier.isEmpty())
        platform::fatalError("an option button has no identifier");

    const QString kind = identifier.section(QLatin1Char('#'), 0, 0);
    PopoverView *popover = nullptr;
    PopoverChoice choice {};
    if (kind == QStringLiteral("brush")) {
        popover = m_brushPopoverView.get();
        choice = PopoverChoice::brushpopover;
    } else if (kind == QStringLiteral("color")) {
        if (ToolPanelOptionDelegate *const panel = m_toolPanelOptionDelegate.get())
            panel->changeColorToolImage(identifier);
        popover = m_colorPopoverView.get();
        choice = PopoverChoice::colorpopover;
    } else if (kind == QStringLiteral("text")) {
        popover = m_textPopoverView.get();
        choice = PopoverChoice::textpopover;
    } else {
        return;
    }
    option.toogleButtonState(*require(popover, "a popover view is missing"), choice);
    if (ToolSelectionDelegate *const drawing = m_toolPopoverDelegate.get())
        drawing->handleToolOptionSelection(identifier);
    closePopover();
}

bool PopoverViewController::resignFirstResponder()
{
    closePopover();
    return ViewController::resignFirstResponder();
}

void PopoverViewController::closePopover()
{
    if (m_currentPopoverWindow)
        m_currentPopoverWindow->orderOut();
}

} // namespace penwick
