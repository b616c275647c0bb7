// SPDX-License-Identifier: MIT
// The window of the tool bar.
#pragma once

#include <penwick/platform/Window.h>

namespace penwick {

/// A panel and nothing more; a class of its own so that the scene can name it.
class ToolBarPanelWindow final : public platform::Window
{
    Q_OBJECT

public:
    using platform::Window::Window;
};

} // namespace penwick
