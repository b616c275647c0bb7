// SPDX-License-Identifier: MIT
#include "strokes/StrokeIndex.h"

#include "content/EntryListChange.h"
#include "strokes/StrokeHitTest.h"

#include <penwick/platform/BezierPath.h>

#include <boost/geometry.hpp>
#include <boost/geometry/geometries/box.hpp>
#include <boost/geometry/geometries/point_xy.hpp>
#include <boost/geometry/index/rtree.hpp>
#include <boost/iterator/function_output_iterator.hpp>

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace penwick {

using platform::Point;
using platform::Rect;

namespace {

namespace geometry = boost::geometry;

using TreePoint = geometry::model::d2::point_xy<float>;
using TreeBox = geometry::model::box<TreePoint>;

constexpr std::size_t strokesOfANode = 16;
constexpr double longestPiece = 64.0; // points
constexpr double mostPieces = 1000.0; // bounds the work for two events that are very far apart
// The tree is built anew if more than one place in so many has changed: that is faster than many
// single changes, and gives a better tree.
constexpr std::size_t placesPerSingleChange = 8;

// Rounded outwards: the tree may find a stroke too many, never one too few.
float below(double value)
{
    return std::nextafter(static_cast<float>(value), -std::numeric_limits<float>::infinity());
}

float above(double value)
{
    return std::nextafter(static_cast<float>(value), std::numeric_limits<float>::infinity());
}

} // namespace

class StrokeIndex::Tree
{
public:
    static TreeBox box(const Bounds &bounds)
    {
        return { { bounds.left, bounds.bottom }, { bounds.right, bounds.top } };
    }

    struct BoxOfPlace
    {
        using result_type = TreeBox;
        result_type operator()(const Place &place) const { return box(place.bounds); }
    };
    struct SamePlace
    {
        bool operator()(const Place &a, const Place &b) const { return a.number == b.number; }
    };
    using Places = geometry::index::rtree<Place, geometry::index::quadratic<strokesOfANode>,
        BoxOfPlace, SamePlace>;

    /// Makes the tree hold exactly the places in `all`.
    void bringUpTo(const std::deque<Place> &all)
    {
        const std::size_t come = all.size() - taken;
        if ((gone.size() + come) * placesPerSingleChange > all.size()) {
            places = Places(all);
        } else {
            for (const Place &place : gone)
                places.remove(place);
            places.insert(all.end() - static_cast<std::ptrdiff_t>(come), all.end());
        }
        gone = {}; // and its memory
        taken = all.size();
    }

    Places places;
    std::size_t taken = 0; // how many places at the front of the list are in the tree
    std::vector<Place> gone; // places that have left the list, but not yet the tree
};

StrokeIndex::StrokeIndex()
    : m_tree(std::make_unique<Tree>())
{ }

StrokeIndex::~StrokeIndex() = default;

StrokeIndex::Bounds StrokeIndex::boundsOf(const StrokeEntry &stroke)
{
    const Rect bounds
        = stroke.bPath->controlPointBounds().grownBy(std::max(stroke.bPath->lineWidth() / 2, 0.0));
    return { below(bounds.x), below(bounds.y), above(bounds.maxX()), above(bounds.maxY()) };
}

void StrokeIndex::follow(const EntryList<StrokeEntry> &strokes)
{
    const EntryListChange change = changeBetween(m_strokes, strokes, isSameStroke);
    m_strokes = strokes;
    if (change.added == 0 && change.first < strokes.size()) {
        forget(change.first, change.first + change.removed);
        return;
    }
    // Everything behind the change is numbered anew, so that numbers rise from old to new. The
    // newest stroke gets no number, because it may still grow.
    const int wanted = std::max(0, strokes.size() - 1);
    const int present = static_cast<int>(m_places.size());
    forget(std::min({ change.first, wanted, present }), present);
    for (int index = static_cast<int>(m_places.size()); index < wanted; ++index)
        m_places.push_back({ boundsOf(m_strokes[index]), m_nextNumber++ });
}

void StrokeIndex::forget(int from, int to)
{
    if (from == 0 && to == static_cast<int>(m_places.size())) { // keeps no memory of what is gone
        m_tree = std::make_unique<Tree>();
        m_places = {};
        return;
    }
    const int taken = std::clamp(static_cast<int>(m_tree->taken), from, to);
    m_tree->gone.insert(m_tree->gone.end(), m_places.begin() + from, m_places.begin() + taken);
    m_tree->taken -= static_cast<std::size_t>(taken - from);
    m_places.erase(m_places.begin() + from, m_places.begin() + to);
}

template <class Visit>
void StrokeIndex::visit(const Rect &area, Visit visit) const
{
    m_tree->bringUpTo(m_places);
    const TreeBox box { { below(area.x), below(area.y) },
        { above(area.maxX()), above(area.maxY()) } };
    const auto visitPlace = [this, &visit](const Place &place) {
        const auto found = std::ranges::lower_bound(m_places, place.number, {}, &Place::number);
        visit(static_cast<int>(found - m_places.begin()));
    };
    m_tree->places.query(
        geometry::index::intersects(box), boost::make_function_output_iterator(visitPlace));
    const int newest = m_strokes.size() - 1;
    if (newest >= 0 && geometry::intersects(Tree::box(boundsOf(m_strokes[newest])), box))
        visit(newest);
}

std::optional<int> StrokeIndex::oldestAt(Point point) const
{
    std::optional<int> oldest;
    visit({ point.x, point.y, 0.0, 0.0 }, [&](int index) {
        if ((!oldest || index < *oldest) && strokeContains(*m_strokes[index].bPath, point))
            oldest = index;
    });
    return oldest;
}

// The one rectangle around a long slanting way may hold many strokes that are nowhere near the way.
// The rectangles around its pieces hold far fewer.
std::vector<int> StrokeIndex::near(const Way &way) const
{
    const double wanted = std::ceil(way.length() / longestPiece);
    const int pieces = static_cast<int>(std::clamp(wanted, 1.0, mostPieces));
    std::vector<int> found;
    for (int piece = 0; piece < pieces; ++piece) {
        const auto end = [&](int number) { return way.at(static_cast<double>(number) / pieces); };
        visit(Rect::spanning(end(piece), end(piece + 1)),
            [&found](int index) { found.push_back(index); });
    }
    std::ranges::sort(found);
    const auto repeated = std::ranges::unique(found);
    found.erase(repeated.begin(), repeated.end());
    return found;
}

Meetings StrokeIndex::meetingsOn(const Way &way) const
{
    Meetings meetings;
    std::vector<std::pair<double, int>> met; // part of the way, index
    for (const int index : near(way)) {
        const Meeting meeting = meetingOn(way, *m_strokes[index].bPath);
        meetings.isAtEnd = meetings.isAtEnd || meeting.isAtEnd;
        if (meeting.part)
            met.emplace_back(*meeting.part, index);
    }
    std::ranges::sort(met);
    for (const auto &[part, index] : met)
        meetings.places.push_back(way.at(part));
    return meetings;
}

std::vector<int> StrokeIndex::touching(const Rect &area) const
{
    std::vector<int> found;
    visit(area, [&found](int index) { found.push_back(index); });
    std::ranges::sort(found);
    return found;
}

} // namespace penwick
