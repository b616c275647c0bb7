// SPDX-License-Identifier: MIT
// One of the choices in a popover.
#pragma once

#include "toolpanel/PopoverChoice.h"
#include "toolpanel/ToolPanelButton.h"

namespace penwick {

class PopoverView;

/// An option button: of those in one popover, one is selected.
class ToolOptionsButton final : public ToolPanelButton
{
    Q_OBJECT

public:
    explicit ToolOptionsButton(QWidget *parent = nullptr);
    explicit ToolOptionsButton(const platform::Rect &frame);

    [[nodiscard]] QColor hoverBackgroundColor() const override;
    [[nodiscard]] QColor originalBackgroundColor() const override;

    void mouseEntered() override;
    void toggleToolState() override;
    /// Makes the button that was just pressed, whose state the press turned on, the only selected
    /// one of `popoverView`. The spelling is fixed; the type is not used. A popover without a grid,
    /// or with something else in it than option buttons, stops the process.
    void toogleButtonState(PopoverView &popoverView, PopoverChoice popoverType);
};

} // namespace penwick
