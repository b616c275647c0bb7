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
    explicit ToolBarPanelWindow(QWidget *parent = nullptr)
        : Window(parent)
    { }
    /// All four go to the panel's own constructor as they are.
    ToolBarPanelWindow(const platform::Rect &contentRect, platform::StyleMasks styleMask,
        platform::BackingStore backing, bool defer)
        : Window(contentRect, styleMask, backing, defer)
    { }
};

} // namespace penwick
