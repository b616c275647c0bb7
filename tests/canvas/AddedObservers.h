// SPDX-License-Identifier: MIT
// The names of the notifications that observers were added for, in order.
// Nobody can see from outside in which order an object observes notifications of different names,
// so the linker leads every call of addObserver() in this program through here.
#pragma once

#include <QStringList>

namespace penwick::test {

/// The names that `observer` was added for, the first one first, since the program began.
[[nodiscard]] QStringList namesObservedBy(const void *observer);

} // namespace penwick::test
