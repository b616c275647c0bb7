// SPDX-License-Identifier: MIT
// Which strokes lie where.
#pragma once

#include "content/CanvasContent.h"
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
    /// For each stroke the place where the pointer first meets it, in the order in which it comes
    /// to them; where it meets several at once the oldest comes first. Strokes that it meets only
    /// at the end of its way are left out.
    std::vector<platform::Point> places;
    bool isAtEnd = false; ///< whether a stroke lies at the end
};

/// Finds the strokes of a list by place, without asking each of them.
///
/// The index must be told of every change of the list but one: the newest stroke may grow without a
/// word. No other stroke may grow. Telling it costs little: the next question takes in all that has
/// changed since the last one. The index takes little memory next to the strokes themselves. GUI
/// thread only.
class StrokeIndex
{
public:
    StrokeIndex();
    ~StrokeIndex();

    /// Takes `strokes` as the list from now on.
    void follow(const EntryList<StrokeEntry> &strokes);

    /// The index of the oldest stroke that `point` lies on.
    [[nodiscard]] std::optional<int> oldestAt(platform::Point point) const;
    /// Where the strokes are met on `way`.
    [[nodiscard]] Meetings meetingsOn(const Way &way) const;
    /// The indices, oldest first, of the strokes whose bounds, thickness included, touch `area`.
    [[nodiscard]] std::vector<int> touching(const platform::Rect &area) const;

private:
    // A stroke as the tree knows it. The tree cannot know it by its index, which changes when an
    // older stroke is removed. The number never changes, and numbers rise from old to new.
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
    void forget(int from, int to);
    [[nodiscard]] std::vector<int> near(const Way &way) const;
    template <class Visit>
    void visit(const platform::Rect &area, Visit visit) const;

    EntryList<StrokeEntry> m_strokes;
    // One for each stroke but the newest, which may still grow. It is a deque because a vector may
    // reserve twice the memory that it needs.
    std::deque<Place> m_places;
    std::uint32_t m_nextNumber = 0;
    std::unique_ptr<Tree> m_tree; // of m_places, as they were when it was asked last
};

} // namespace penwick
