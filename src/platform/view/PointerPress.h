// SPDX-License-Identifier: MIT
// Knows whether the pointer is held down on a view, and puts off what must not happen meanwhile.
#pragma once

#include <QObject>

#include <functional>

namespace penwick::platform {

/// A view was pressed: from now on what afterPointerIsReleased() is given waits.
void pointerWasPressed();
/// The pointer was let go, or its release will never be heard: what has waited runs, in order.
void pointerWasReleased();

/// Runs `action` at once, or, while the pointer is held down on a view, as soon as it is let go.
/// Dropped if `context` dies before.
void afterPointerIsReleased(QObject &context, std::function<void()> action);

} // namespace penwick::platform
