// SPDX-License-Identifier: MIT
// The controller of a scene that holds a text box.
#pragma once

#include "platform/view/ViewController.h"

namespace penwick {

/// A plain view controller; a scene of a text box names this class.
class TextBoxViewController final : public platform::ViewController
{
    Q_OBJECT
};

} // namespace penwick
