// SPDX-License-Identifier: MIT
#include "session/SharingNotificationScene.h"

#include "platform/PlainView.h"
#include "session/BannerLabel.h"
#include "session/SharingNotificationViewController.h"

#include <penwick/platform/WindowController.h>

#include "ui_SharingNotification.h"

namespace penwick {

std::unique_ptr<QObject> makeSharingNotificationScene()
{
    auto window = std::make_unique<platform::Window>();
    platform::WindowAttributes attributes;
    attributes.styleMask = 0; // nothing but its content
    window->setAttributes(attributes);
    Ui::SharingNotification scene;
    scene.setupUi(window.get());
    window->adoptScene();

    auto content = std::make_unique<SharingNotificationViewController>();
    content->setView(*scene.bannerView);
    window->setContentViewController(std::move(content));

    auto controller = std::make_unique<platform::WindowController>();
    controller->setWindow(std::move(window));
    return controller;
}

} // namespace penwick
