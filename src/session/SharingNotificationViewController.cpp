// SPDX-License-Identifier: MIT
#include "session/SharingNotificationViewController.h"

#include "appearance/ViewBorder.h"
#include "platform/view/View.h"

namespace penwick {

namespace {

constexpr QColor darkGray { 85, 85, 85 };
constexpr float groundOpacity = 0.5F;
constexpr double cornerRadius = 4.0; // points

} // namespace

void SharingNotificationViewController::viewDidLoad()
{
    ViewController::viewDidLoad();
    view()->setWantsLayer(true);
    QColor ground = darkGray;
    ground.setAlphaF(groundOpacity);
    view()->layer()->backgroundColor = ground;
    setViewBorder(*view(), Qt::transparent, 0.0, cornerRadius);
}

} // namespace penwick
