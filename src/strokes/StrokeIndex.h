// SPDX-License-Identifier: MIT
// Which strokes lie where.
#pragma once

#include "content/CanvasContent.h"
#include "content/EntryListChange.h"
#include "strokes/StrokeCrossing.h"

#include <penwick/platform/Geometry.h>

#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <vector>

namespace penwick {

/// Where a pointer meets strokes on its way.
struct Meetings
{
    /// Where each is met first, in the order of the way; of strokes that are met at once the oldest
    /// comes first. Without what is met only at the end.
    std::vector<platform::Point> places;
    bool isAtEnd = false; ///< whether a stroke lies at the end
};

/// Finds the strokes of a list by place, without asking each of them.
///
/// Follows a list: it has to be told of every change but the growth of the newest stroke, which is
/// the only one that may grow. Small next to the strokes themselves. GUI thread only.
class StrokeIndex
{
public:
    StrokeIndex();
    ~StrokeIndex();

    /// The list as it was last told.
    [[nodiscard]] const EntryList<StrokeEntry> &strokes() const { return m_strokes; }
    /// Takes `strokes` for the list from now on; gives what has changed.
    EntryListChange follow(const EntryList<StrokeEntry> &strokes);

    /// The index of the oldest stroke that `point` lies on.
    [[nodiscard]] std::optional<int> oldestAt(platform::Point point) const;
    /// Where the strokes are met on `way`.
    [[nodiscard]] Meetings meetingsOn(const Way &way) const;
    /// The indices, oldest first, of the strokes whose bounds, thickness included, touch `area`.
    [[nodiscard]] std::vector<int> touching(const platform::Rect &area) const;

private:
    // A stroke's place in the tree. It has a number of its own because indices move when a stroke
    // goes; numbers keep the order.
    struct Bounds
    {
        float left, bottom, right, top;
    };
    struct Place
    {
        Bounds bounds {};
        std::uint32_t number = 0;
    };
    class Tree;

    static Bounds boundsOf(const StrokeEntry &stroke);
    void insert(int from, int to);
    void remove(int from, int to);
    [[nodiscard]] std::vector<int> near(const Way &way) const;
    template <class Visit>
    void visit(const platform::Rect &area, Visit visit) const;

    EntryList<StrokeEntry> m_strokes;
    // Of all strokes but the newest, which may grow. A deque has no room to spare.
    std::deque<Place> m_places;
    std::uint32_t m_nextNumber = 0;
    std::unique_ptr<Tree> m_tree;
};

} // namespace penwick
