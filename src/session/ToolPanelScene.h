// SPDX-License-Identifier: MIT
// The scene "ToolPanelWindowController".
#pragma once

#include <QObject>

#include <memory>

namespace penwick {

namespace platform {
class Bundle;
}

/// A new tool bar in its panel, with images from `bundle`, both loaded; the object is its
/// ToolPanelWindowController.
[[nodiscard]] std::unique_ptr<QObject> makeToolPanelScene(const platform::Bundle &bundle);

} // namespace penwick
