// SPDX-License-Identifier: MIT
// How keys work the tool bar, and which presses and keys make letters and digits rest.
#include "toolpanel/ToolPanelViewController.h"

#include "canvas/DrawingCanvasView.h"
#include "platform/view/View.h"
#include "platform/view/ViewInput.h"
#include "platform/window/WindowContent.h"
#include "toolpanel/ToolKeys.h"
#include "toolpanel/ToolPanelButton.h"

#include <penwick/platform/Window.h>

#include <QKeyEvent>

namespace penwick {

void ToolPanelViewController::followInput()
{
    const platform::ViewInput &input = platform::ViewInput::shared();
    connect(&input, &platform::ViewInput::pressed, this, &ToolPanelViewController::onPressed);
    connect(&input, &platform::ViewInput::keyPressed, this, &ToolPanelViewController::onKeyPressed);
}

bool ToolPanelViewController::isInOwnWindow(const platform::View &pressed) const
{
    const QWidget *const window = pressed.widget().window();
    return window == view()->widget().window() || window == m_popoverW.get();
}

DrawingCanvasView *ToolPanelViewController::canvasIfAny() const
{
    const auto *const drawing
        = dynamic_cast<DrawingCanvasDelegate *>(m_toolSelectionDelegate.get());
    return drawing ? drawing->drawingView() : nullptr;
}

void ToolPanelViewController::onPressed(const platform::View &view)
{
    const DrawingCanvasView *const canvas = canvasIfAny();
    if (canvas && canvas->hasPlacedTextBox(view))
        m_keyRest.placedBoxPressed();
    else if (isInOwnWindow(view) || (canvas && view.window() == canvas->window()))
        m_keyRest.pointerPressed();
}

void ToolPanelViewController::onKeyPressed(const platform::View &view)
{
    const DrawingCanvasView *const canvas = canvasIfAny();
    if (canvas && view.window() == canvas->window() && canvas->isTextEdited())
        m_keyRest.keyEdited();
}

bool ToolPanelViewController::performKey(const QKeyEvent &event)
{
    const DrawingCanvasView *const canvas = canvasIfAny(); // none before the panel appeared
    if (!canvas || canvas->isTextEdited() || event.isAutoRepeat()
        || (isTyped(event) && m_keyRest.rests()))
        return false;
    if (m_popoverW->isVisible() && performPopoverKey(event))
        return true;
    ToolPanelButton *const pressed = button(toolForKey(event));
    if (pressed)
        pressed->click();
    return pressed;
}

bool ToolPanelViewController::performPopoverKey(const QKeyEvent &event)
{
    if (event.key() == Qt::Key_Escape) {
        hidePopover();
        return true;
    }
    const platform::View *const popover = platform::contentOf(*m_popoverW).contentView();
    const std::vector<platform::View *> options = popover->subviews().front()->subviews();
    const auto index = static_cast<std::size_t>(optionForKey(event));
    if (index >= options.size())
        return false;
    dynamic_cast<platform::Button &>(*options[index]).click();
    return true;
}

} // namespace penwick
