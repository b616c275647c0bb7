// SPDX-License-Identifier: MIT
// What differs between two states of a list.
#pragma once

#include "content/EntryList.h"

#include <algorithm>

namespace penwick {

/// From index `first` on, `removed` entries gave way to `added` others; what follows them is the
/// same again.
struct EntryListChange
{
    int first = 0;
    int removed = 0;
    int added = 0;

    [[nodiscard]] bool isNothing() const { return removed == 0 && added == 0; }
    friend bool operator==(const EntryListChange &, const EntryListChange &) = default;
};

/// The smallest change that makes `before` into `after`; `same` tells whether two entries are the
/// same one. Entries in a store that both lists share are not compared, so after an append() or a
/// removeLast() the cost does not grow with the list.
template <class T, class Same>
[[nodiscard]] EntryListChange changeBetween(
    const EntryList<T> &before, const EntryList<T> &after, Same same)
{
    const int shorter = std::min(before.size(), after.size());
    int first = before.sharedStart(after);
    while (first < shorter && same(before[first], after[first]))
        ++first;
    int kept = 0; // at the end
    while (kept < shorter - first
        && same(before[before.size() - 1 - kept], after[after.size() - 1 - kept]))
        ++kept;
    return { first, before.size() - first - kept, after.size() - first - kept };
}

} // namespace penwick
