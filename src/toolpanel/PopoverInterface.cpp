// SPDX-License-Identifier: MIT
#include "toolpanel/PopoverInterface.h"

#include "platform/foundation/FatalError.h"
#include "platform/scene/ButtonImages.h"
#include "platform/view/PlainView.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolOptionsButton.h"

#include "ui_CommonPopoverView.h"

namespace penwick {

namespace {

// Takes `popover` out of the widget in which the interface file has all three, and makes it ready
// to be put into the popovers' window.
std::unique_ptr<PopoverView> taken(
    PopoverView &popover, PopoverViewController &owner, const platform::Bundle &bundle)
{
    for (auto *const option : popover.findChildren<ToolOptionsButton *>()) {
        platform::loadImages(*option, bundle);
        option->setAction(
            [&owner](platform::Button &sender) { owner.OnToolOptionSelection(sender); });
    }
    popover.setParent(nullptr);
    popover.adoptScene();
    for (auto *const option : popover.findChildren<ToolOptionsButton *>())
        option->toggleToolState(); // shows which option the interface file selects
    return std::unique_ptr<PopoverView>(&popover);
}

} // namespace

void loadPopoverInterface(QObject &owner, const platform::Bundle &bundle)
{
    auto &controller = *platform::require(dynamic_cast<PopoverViewController *>(&owner),
        "the popovers' interface belongs to a popover view controller");
    QWidget common;
    Ui::CommonPopoverView interface;
    interface.setupUi(&common);
    auto text = taken(*interface.textPopoverView, controller, bundle);
    auto color = taken(*interface.colorPopoverView, controller, bundle);
    auto brush = taken(*interface.brushPopoverView, controller, bundle);
    PopoverView &first = *text;
    controller.setPopoverViews(std::move(text), std::move(color), std::move(brush));
    controller.setView(first);
}

} // namespace penwick
