// SPDX-License-Identifier: MIT
#include "soak/PlainDrawing.h"

#include <algorithm>
#include <cmath>
#include <optional>

namespace penwick::test {

namespace {

bool isStroke(const std::string &name)
{
    return name.front() == 's';
}

double distance(Spot from, const std::pair<Spot, Spot> &segment)
{
    const auto &[a, b] = segment;
    const double dx = b.x - a.x;
    const double dy = b.y - a.y;
    const double square = dx * dx + dy * dy;
    const double along = square == 0.0
        ? 0.0
        : std::clamp(((from.x - a.x) * dx + (from.y - a.y) * dy) / square, 0.0, 1.0);
    return std::hypot(from.x - (a.x + along * dx), from.y - (a.y + along * dy));
}

Spot between(Spot from, Spot to, double part)
{
    return { from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part };
}

/// Where `value`, which falls up to `end`, reaches `wanted`.
template <class Value>
double halved(Value value, double wanted, double end)
{
    double begin = 0.0;
    for (int step = 0; step < 60; ++step) {
        const double middle = (begin + end) / 2;
        (value(middle) > wanted ? begin : end) = middle;
    }
    return end;
}

/// Where `value`, which falls and then rises, is least from 0 to 1.
template <class Value>
double lowest(Value value)
{
    double begin = 0.0;
    double end = 1.0;
    for (int step = 0; step < 100; ++step) {
        const double left = begin + (end - begin) / 3;
        const double right = end - (end - begin) / 3;
        (value(left) > value(right) ? begin : end) = value(left) > value(right) ? left : right;
    }
    return value(0.0) <= value(end) ? 0.0 : end;
}

/// Whether two pairs of places lie apart by more than `gap`, to the sides or up and down.
bool areApart(const std::pair<Spot, Spot> &a, const std::pair<Spot, Spot> &b, double gap)
{
    const auto isApart = [gap](double a1, double a2, double b1, double b2) {
        return std::max(a1, a2) + gap < std::min(b1, b2)
            || std::max(b1, b2) + gap < std::min(a1, a2);
    };
    return isApart(a.first.x, a.second.x, b.first.x, b.second.x)
        || isApart(a.first.y, a.second.y, b.first.y, b.second.y);
}

/// How far along the way a segment is met first; nothing where it is not.
std::optional<double> partThatMeets(
    Spot from, Spot to, const std::pair<Spot, Spot> &segment, double radius)
{
    if (areApart({ from, to }, segment, radius))
        return std::nullopt;
    const auto away = [&](double part) { return distance(between(from, to, part), segment); };
    const double nearest = lowest(away);
    if (away(nearest) > radius)
        return std::nullopt;
    return away(0.0) <= radius ? 0.0 : halved(away, radius, nearest);
}

} // namespace

std::vector<std::string> &PlainDrawing::listOf(const std::string &name)
{
    return isStroke(name) ? m_strokes : m_boxes;
}

// Rules of the history's properties

void PlainDrawing::setUndoCount(std::int64_t count)
{
    if (count == 0)
        m_post("enableUndo true");
    else if (count == 5)
        m_post("enableUndo false");
    m_undoCount = count;
}

void PlainDrawing::emptyUndo()
{
    m_post("enableUndo false");
    m_undo.clear();
}

void PlainDrawing::emptyRedo()
{
    m_redo.clear();
    m_post("enableRedo false");
}

void PlainDrawing::popUndo()
{
    if (m_undo.size() == 1)
        m_post("enableUndo false");
    m_undo.pop_back();
}

void PlainDrawing::announceRedo()
{
    if (m_redo.empty())
        m_post("enableRedo false");
    else if (m_redo.size() <= 5)
        m_post("enableRedo true");
}

void PlainDrawing::record(const std::string &action, const std::string &name)
{
    if (!m_undo.empty() && m_undo.back().action == "clear")
        emptyUndo();
    setUndoCount(0);
    m_undo.push_back({ action, name });
}

// What the user does

void PlainDrawing::beginStroke(Spot start, double width)
{
    const std::string name = "s" + std::to_string(++m_strokesMade);
    m_known[name] = { width, start, {} };
    m_strokes.push_back(name);
    record("draw", name);
    emptyRedo();
}

void PlainDrawing::extendStroke(Spot to)
{
    if (m_strokes.empty())
        return;
    Stroke &newest = m_known.at(m_strokes.back());
    newest.segments.emplace_back(newest.next, to);
    newest.next = to;
}

bool PlainDrawing::eraseAt(Spot place)
{
    const auto hit = std::find_if(m_strokes.begin(), m_strokes.end(), [&](const auto &name) {
        const Stroke &stroke = m_known.at(name);
        return std::any_of(stroke.segments.begin(), stroke.segments.end(),
            [&](const auto &segment) { return distance(place, segment) <= stroke.width / 2; });
    });
    if (hit == m_strokes.end())
        return false;
    record("erase", *hit);
    emptyRedo();
    m_strokes.erase(hit);
    return true;
}

std::vector<Spot> PlainDrawing::metBetween(Spot from, Spot to) const
{
    constexpr double behindTheEdge = 1e-6; // points, so that it surely is on it
    const double length = std::hypot(to.x - from.x, to.y - from.y);
    std::vector<double> parts;
    for (const std::string &name : m_strokes) {
        const Stroke &stroke = m_known.at(name);
        std::optional<double> first;
        for (const auto &segment : stroke.segments) {
            const auto part = partThatMeets(from, to, segment, stroke.width / 2);
            if (part && (!first || *part < *first))
                first = part;
        }
        if (first && (1 - *first) * length > behindTheEdge)
            parts.push_back(*first + behindTheEdge / length);
    }
    std::sort(parts.begin(), parts.end());
    std::vector<Spot> places;
    for (const double part : parts)
        places.push_back(between(from, to, part));
    return places;
}

std::string PlainDrawing::addBox()
{
    std::string name = "b" + std::to_string(++m_boxesMade);
    m_boxes.push_back(name);
    record("draw", name);
    return name;
}

void PlainDrawing::deleteBox(const std::string &name)
{
    const auto found = std::find(m_boxes.begin(), m_boxes.end(), name);
    if (found == m_boxes.end())
        return;
    m_undo.push_back({ "erase", name });
    m_boxes.erase(found);
}

void PlainDrawing::clear()
{
    emptyUndo();
    emptyRedo();
    for (const auto *const list : { &m_strokes, &m_boxes }) {
        for (const std::string &name : *list)
            m_undo.push_back({ "clear", name });
    }
    setUndoCount(0);
    m_strokes.clear();
    m_boxes.clear();
}

// Undo and redo

bool PlainDrawing::takeAway(const std::string &name)
{
    auto &list = listOf(name);
    const auto found = std::find(list.begin(), list.end(), name);
    if (found == list.end())
        return false;
    list.erase(found);
    return true;
}

void PlainDrawing::takeBoxOffCanvas(const std::string &name)
{
    m_post("removeWithId " + name);
    m_post("redraw");
}

void PlainDrawing::undo()
{
    if (m_undo.empty())
        return;
    setUndoCount(m_undoCount + 1);
    const Record top = m_undo.back();
    if (top.action == "clear") {
        undoClear();
    } else {
        if (top.action == "erase")
            listOf(top.name).push_back(top.name);
        else if (takeAway(top.name) && !isStroke(top.name))
            takeBoxOffCanvas(top.name);
        m_redo.push_back(top);
        announceRedo();
        popUndo();
    }
    m_post("redraw");
}

void PlainDrawing::undoClear()
{
    m_strokes.clear();
    m_boxes.clear();
    while (!m_undo.empty() && m_undo.back().action == "clear") {
        const Record record = m_undo.back();
        listOf(record.name).push_back(record.name);
        m_redo.push_back(record);
        announceRedo();
        popUndo();
    }
}

void PlainDrawing::redo()
{
    if (m_redo.empty())
        return;
    setUndoCount(0);
    const Record top = m_redo.back();
    if (top.action == "clear") {
        redoClear();
    } else {
        if (top.action == "draw")
            listOf(top.name).push_back(top.name);
        else if (takeAway(top.name) && !isStroke(top.name))
            takeBoxOffCanvas(top.name);
        m_undo.push_back(top);
        m_redo.pop_back();
        announceRedo();
    }
    m_post("redraw");
}

void PlainDrawing::redoClear()
{
    while (!m_redo.empty() && m_redo.back().action == "clear") {
        const Record record = m_redo.back();
        // By position: the undo put the group at the end.
        if (isStroke(record.name) && !m_strokes.empty()) {
            m_strokes.pop_back();
        } else if (!m_boxes.empty()) {
            m_boxes.pop_back();
            takeBoxOffCanvas(record.name);
        }
        m_undo.push_back(record);
        m_redo.pop_back();
        announceRedo();
    }
}

} // namespace penwick::test
