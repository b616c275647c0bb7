// SPDX-License-Identifier: MIT
#include "toolpanel/ToolOptionsButton.h"

#include "appearance/Theme.h"
#include "platform/foundation/FatalError.h"
#include "toolpanel/PopoverView.h"

namespace penwick {

ToolOptionsButton::ToolOptionsButton(QWidget *parent)
    : ToolPanelButton(parent)
{ }

ToolOptionsButton::ToolOptionsButton(const platform::Rect &frame)
    : ToolPanelButton(frame)
{ }

QColor ToolOptionsButton::hoverBackgroundColor() const
{
    return TnhColors::toolOptionButtonHoverColor;
}

QColor ToolOptionsButton::originalBackgroundColor() const
{
    return TnhColors::toolOptionButtonColor;
}

void ToolOptionsButton::mouseEntered()
{
    setBackgroundColor(TnhColors::toolOptionButtonHoverColor);
}

void ToolOptionsButton::toggleToolState()
{
    if (isSelected()) {
        setBackgroundColor(TnhColors::toolOptionButtonHoverColor);
        setState(State::Off);
        setImage(buttonAltImage());
    } else {
        setBackgroundColor(TnhColors::toolOptionButtonColor);
        setImage(buttonImage());
    }
}

void ToolOptionsButton::toogleButtonState(PopoverView &popoverView, PopoverChoice)
{
    const std::vector<platform::View *> subviews = popoverView.subviews();
    if (subviews.empty())
        platform::fatalError("a popover has no option buttons");
    for (platform::View *const view : subviews.front()->subviews()) {
        auto *const option = platform::require(
            dynamic_cast<ToolOptionsButton *>(view), "a popover holds more than option buttons");
        option->setIsSelected(option->state() != State::Off);
        option->toggleToolState();
    }
}

} // namespace penwick
