// SPDX-License-Identifier: MIT
// The interface file "CommonPopoverView".
#pragma once

class QObject;

namespace penwick {

namespace platform {
class Bundle;
}

/// Makes the three popovers, with images from `bundle`, for `owner`, which must be a
/// PopoverViewController (else the process stops).
void loadPopoverInterface(QObject &owner, const platform::Bundle &bundle);

} // namespace penwick
