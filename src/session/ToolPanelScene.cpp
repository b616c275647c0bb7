// SPDX-License-Identifier: MIT
#include "session/ToolPanelScene.h"

#include "appearance/Theme.h"
#include "platform/scene/ButtonImages.h"
#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include "ui_ToolPanel.h"

namespace penwick {

namespace {

ToolPanelOutlets outletsOf(const Ui::ToolPanel &scene)
{
    ToolPanelOutlets outlets;
    outlets.toolBarHandle = scene.toolBarHandle;
    outlets.toolPanelView = scene.toolPanelView;
    outlets.textButton = scene.textButton;
    outlets.brushButton = scene.brushButton;
    outlets.eraserButton = scene.eraserButton;
    outlets.colorButton = scene.colorButton;
    outlets.clearButton = scene.clearButton;
    outlets.stateButton = scene.stateButton;
    outlets.redoButton = scene.redoButton;
    outlets.undoButton = scene.undoButton;
    return outlets;
}

} // namespace

std::unique_ptr<QObject> makeToolPanelScene(const platform::Bundle &bundle)
{
    auto panel = std::make_unique<ToolBarPanelWindow>();
    Ui::ToolPanel scene;
    scene.setupUi(panel.get());
    scene.grip->setAttribute(Qt::WA_TransparentForMouseEvents); // the handle below takes them

    for (auto *const rounded : { scene.toolBarHandle, scene.toolPanelRoot }) {
        rounded->setWantsLayer(true);
        rounded->layer()->cornerRadius = ToolPanelUI::toolPanelBorderRadius;
    }

    auto content = std::make_unique<ToolPanelViewController>();
    for (auto *const button : panel->findChildren<platform::Button *>()) {
        platform::loadImages(*button, bundle);
        button->setAction([bar = content.get()](
                              platform::Button &sender) { bar->OnToolBarItemSelection(sender); });
    }
    platform::contentOf(*panel).adoptScene();
    content->outlets() = outletsOf(scene);
    content->setView(*scene.toolPanelRoot);
    panel->expectChildWindow(*content->popoverW());
    platform::contentOf(*panel).setContentViewController(std::move(content));

    auto controller = std::make_unique<ToolPanelWindowController>();
    controller->setToolPanelWindow(panel.get());
    controller->setWindow(std::move(panel));
    return controller;
}

} // namespace penwick
