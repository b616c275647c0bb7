// SPDX-License-Identifier: MIT
// The popovers of the tool bar.
#pragma once

namespace penwick {

/// Which options a popover offers.
enum class PopoverChoice
{
    textpopover,
    colorpopover,
    brushpopover
};

} // namespace penwick
