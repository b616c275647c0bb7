// SPDX-License-Identifier: MIT
#include "platform/ViewController.h"

namespace penwick::platform {

ViewController::ViewController() = default;
ViewController::~ViewController() = default;

void ViewController::setView(View &view)
{
    m_view = &view;
    viewDidLoad();
}

} // namespace penwick::platform
