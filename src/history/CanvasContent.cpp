// SPDX-License-Identifier: MIT
#include "history/CanvasContent.h"

namespace penwick {

CanvasContent::CanvasContent() = default;
CanvasContent::~CanvasContent() = default;

} // namespace penwick
