// SPDX-License-Identifier: MIT
#include "platform/view/ViewController.h"

#include "platform/view/View.h"

namespace penwick::platform {

ViewController::ViewController() = default;
ViewController::~ViewController() = default;

void ViewController::setView(View &view)
{
    m_view = &view;
    view.setNextResponder(this);
    viewDidLoad();
}

} // namespace penwick::platform
