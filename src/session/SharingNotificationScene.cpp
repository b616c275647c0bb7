// SPDX-License-Identifier: MIT
#include "session/SharingNotificationScene.h"

#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WorkArea.h"
#include "session/BannerLabel.h"
#include "session/SharingNotificationViewController.h"

#include <penwick/platform/WindowController.h>

#include "ui_SharingNotification.h"

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

constexpr double screenMargin = 20.0; // points, beside a banner as wide as the screen

// The banner's words are longer in other languages. If not even the screen is wide enough for them,
// the label shortens them.
void growFor(const Ui::SharingNotification &scene, QWidget &window)
{
    const double room = platform::workAreaFor({}).width - 2 * screenMargin - window.width();
    const double missing = scene.bannerLabel->widthOfText() - scene.bannerLabel->width();
    const int more = static_cast<int>(std::ceil(std::min(missing, room)));
    if (more <= 0)
        return;
    for (QWidget *const widget : { &window, static_cast<QWidget *>(scene.bannerView),
             static_cast<QWidget *>(scene.bannerLabel) })
        widget->resize(widget->width() + more, widget->height());
}

} // namespace

std::unique_ptr<QObject> makeSharingNotificationScene()
{
    auto window = std::make_unique<platform::Window>();
    platform::WindowAttributes attributes;
    attributes.styleMask = {}; // no frame, only the content
    window->setAttributes(attributes);
    Ui::SharingNotification scene;
    scene.setupUi(window.get());
    growFor(scene, *window);
    platform::contentOf(*window).adoptScene();

    auto content = std::make_unique<SharingNotificationViewController>();
    content->setView(*scene.bannerView);
    platform::contentOf(*window).setContentViewController(std::move(content));

    auto controller = std::make_unique<platform::WindowController>();
    controller->setWindow(std::move(window));
    return controller;
}

} // namespace penwick
