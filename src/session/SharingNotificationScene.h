// SPDX-License-Identifier: MIT
// The scene "SharingNotificationWindowController".
#pragma once

#include <QObject>

#include <memory>

namespace penwick {

/// A new banner, loaded; the object is a plain window controller.
[[nodiscard]] std::unique_ptr<QObject> makeSharingNotificationScene();

} // namespace penwick
