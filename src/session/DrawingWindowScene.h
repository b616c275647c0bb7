// SPDX-License-Identifier: MIT
// The scene "DrawingWindowController".
#pragma once

#include <QObject>

#include <memory>

namespace penwick {

/// A new drawing window with its canvas, both loaded; the object is its DrawingWindowController.
[[nodiscard]] std::unique_ptr<QObject> makeDrawingWindowScene();

} // namespace penwick
