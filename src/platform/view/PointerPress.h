// SPDX-License-Identifier: MIT
// Whether the pointer is being held down on a view, for what must not happen meanwhile.
#pragma once

#include <QObject>

#include <functional>

namespace penwick::platform {

/// A view was pressed; what afterPointerIsReleased() gets from now on waits.
void pointerWasPressed();
/// It was let go, or will not be heard of again: what has waited runs, in order.
void pointerWasReleased();

/// Runs `action` at once, or, while the pointer is held down on a view, as soon as it is let go.
/// Dropped if `context` dies before.
void afterPointerIsReleased(QObject &context, std::function<void()> action);

} // namespace penwick::platform
