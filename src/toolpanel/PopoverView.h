// SPDX-License-Identifier: MIT
// The content of a popover.
#pragma once

#include "platform/view/ViewOf.h"

#include <QWidget>

namespace penwick {

/// Its first subview is the grid, which holds option buttons and nothing else. The popover takes
/// its colours when it enters a window.
class PopoverView final : public platform::ViewOf<QWidget>
{
    Q_OBJECT

public:
    explicit PopoverView(QWidget *parent = nullptr);
    explicit PopoverView(const platform::Rect &frame);

    void setUpLayer();
    void viewDidMoveToWindow() override;
};

} // namespace penwick
