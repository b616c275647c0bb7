// SPDX-License-Identifier: MIT
// What a process holds that a session could leave behind.
#pragma once

#include <QString>
#include <QWidget>

#include <cstddef>

namespace penwick::test {

/// The windows, widgets and timers of the process, and the memory it has asked for.
struct Ledger
{
    qsizetype windows = 0; ///< of the toolkit, on the screen or not
    qsizetype widgets = 0;
    qsizetype timers = 0; ///< one-shots that nobody owns
    std::size_t memory = 0; ///< bytes, as the allocator counts them; 0 where it does not

    /// All widgets but the toolkit's stand-in for the desktop, which it makes once and keeps.
    [[nodiscard]] static QWidgetList widgetsThatAre();
    /// What the process holds now. What was left to the event loop to delete must have been
    /// deleted.
    [[nodiscard]] static Ledger taken();
};

/// What `after` holds more than `before`, one line each; empty if nothing. `sessions` is the number
/// of sessions between the two: memory counts as left behind if it grew by more than 24 bytes for
/// each, which is less than the smallest block that the allocator gives.
[[nodiscard]] QString leftBehind(const Ledger &before, const Ledger &after, int sessions);

/// Makes the allocator count exactly: starts the program anew if it has to, with `arguments`.
void countMemoryExactly(char **arguments);

} // namespace penwick::test
