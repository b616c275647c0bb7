// SPDX-License-Identifier: MIT
// The content of the banner that announces sharing.
#pragma once

#include "platform/view/ViewController.h"

namespace penwick {

/// Gives the banner its translucent dark ground and round corners.
class SharingNotificationViewController final : public platform::ViewController
{
    Q_OBJECT

public:
    void viewDidLoad() override;
};

} // namespace penwick
