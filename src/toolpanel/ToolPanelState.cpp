// SPDX-License-Identifier: MIT
// The stored values of the tool bar's controller, as they are read and assigned.
#include "toolpanel/ToolPanelViewController.h"

#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolPanelButton.h"

namespace penwick {

ToolSelectionDelegate *ToolPanelViewController::toolSelectionDelegate() const
{
    return m_toolSelectionDelegate.get();
}

void ToolPanelViewController::setToolSelectionDelegate(ToolSelectionDelegate *delegate)
{
    m_toolSelectionDelegate = delegate;
}

PopoverViewController *ToolPanelViewController::popoverVc() const
{
    return m_popoverVc;
}

const std::optional<ToolPanelViewController::ButtonMapping> &
ToolPanelViewController::buttonMapping() const
{
    return m_buttonMapping;
}

void ToolPanelViewController::setButtonMapping(const std::optional<ButtonMapping> &mapping)
{
    m_buttonMapping = mapping;
}

const std::optional<ToolPanelViewController::Buttons> &ToolPanelViewController::buttons() const
{
    return m_buttons;
}

void ToolPanelViewController::setButtons(const std::optional<Buttons> &buttons)
{
    m_buttons = buttons;
}

ToolPanelButton *ToolPanelViewController::lastSelectedTool() const
{
    return m_lastSelectedTool;
}

void ToolPanelViewController::setLastSelectedTool(ToolPanelButton *button)
{
    m_lastSelectedTool = button;
}

ToolPanelButton *ToolPanelViewController::lastSelectedButton() const
{
    return m_lastSelectedButton;
}

void ToolPanelViewController::setLastSelectedButton(ToolPanelButton *button)
{
    m_lastSelectedButton = button;
}

ToolPanelButton *ToolPanelViewController::currentSelectedButton() const
{
    return m_currentSelectedButton;
}

void ToolPanelViewController::setCurrentSelectedButton(ToolPanelButton *button)
{
    m_currentSelectedButton = button;
}

} // namespace penwick
