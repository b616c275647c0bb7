// SPDX-License-Identifier: MIT
// The component's own resources, with every scene that its parts ask for.
#pragma once

#include "platform/scene/Bundle.h"

#include <memory>

namespace penwick {

/// A new bundle of everything that was compiled into the component.
[[nodiscard]] std::shared_ptr<platform::Bundle> makeComponentBundle();

} // namespace penwick
