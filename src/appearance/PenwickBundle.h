// SPDX-License-Identifier: MIT
// The reference through which every part finds the component's resources.
#pragma once

#include "platform/scene/Bundle.h"

#include <memory>

namespace penwick {

/// The component's bundle; null until the first Penwick object was made. GUI thread only.
[[nodiscard]] const std::shared_ptr<platform::Bundle> &penwickBundle();
/// Replaces the bundle, as every new Penwick object does.
void setPenwickBundle(std::shared_ptr<platform::Bundle> bundle);

} // namespace penwick
