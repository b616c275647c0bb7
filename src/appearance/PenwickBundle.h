// SPDX-License-Identifier: MIT
// The reference through which every part finds the component's resources.
#pragma once

#include "platform/Bundle.h"

#include <memory>

namespace penwick {

/// The component's bundle; null until the first entry object was made. GUI thread only.
[[nodiscard]] const std::shared_ptr<platform::Bundle> &penwickBundle();
/// Replaces it; every new entry object does.
void setPenwickBundle(std::shared_ptr<platform::Bundle> bundle);

} // namespace penwick
