// SPDX-License-Identifier: MIT
// The names under which the history tells the rest of the component what happened.
#pragma once

#include <QString>

namespace penwick {

// Each is made on first use and never destroyed, so it may be read while the process ends.
// Any thread.

/// What every notification name of the component begins with.
[[nodiscard]] const QString &notificationPrefix();

/// Whether undo or redo is to be offered. Object: a QVariantMap with the one key "enableUndo" or
/// "enableRedo" and a bool. The spelling "penwik" inside the name is fixed.
[[nodiscard]] const QString &penwickNotificationKey();

/// The content changed and is to be shown again. No object.
[[nodiscard]] const QString &drawingViewUpdatedNotification();

/// Text boxes are to leave the canvas. Object: a SubviewOperation in its QVariant form.
[[nodiscard]] const QString &drawingCanvasSubviewUpdateNotification();

} // namespace penwick
