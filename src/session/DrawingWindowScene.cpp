// SPDX-License-Identifier: MIT
#include "session/DrawingWindowScene.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"

#include <penwick/DrawingWindowController.h>

#include "ui_DrawingWindow.h"

namespace penwick {

std::unique_ptr<QObject> makeDrawingWindowScene()
{
    auto window = std::make_unique<platform::Window>();
    Ui::DrawingWindow scene;
    scene.setupUi(window.get());
    platform::contentOf(*window).adoptScene();
    scene.drawingView->setWantsLayer(true); // its border, and those of the text boxes on it

    auto content = std::make_unique<DrawViewController>();
    content->setDrawingView(scene.drawingView);
    content->setAnnotatedImageView(scene.annotatedImageView);
    content->setView(*scene.drawingView);
    platform::contentOf(*window).setContentViewController(std::move(content));

    auto controller = std::make_unique<DrawingWindowController>();
    window->setDelegate(controller.get());
    controller->setDrawingWindow(window.get());
    controller->setWindow(std::move(window));
    return controller;
}

} // namespace penwick
