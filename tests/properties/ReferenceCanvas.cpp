// SPDX-License-Identifier: MIT
#include "properties/ReferenceCanvas.h"

#include <algorithm>

namespace penwick::test {

ReferenceCanvas::Ids ReferenceCanvas::idsOf(const std::vector<Item> &items)
{
    Ids ids;
    for (const Item &item : items)
        ids.push_back(item.id);
    return ids;
}

std::vector<ReferenceCanvas::Item> &ReferenceCanvas::arrayOf(const Item &item)
{
    return item.isStroke ? strokes : textBoxes;
}

bool ReferenceCanvas::remove(const Item &item)
{
    std::vector<Item> &array = arrayOf(item);
    for (auto candidate = array.begin(); candidate != array.end(); ++candidate) {
        if (candidate->id == item.id) {
            array.erase(candidate);
            return true;
        }
    }
    return false;
}

void ReferenceCanvas::removeTextBoxFromView(std::int64_t id)
{
    posted.push_back("removeWithId " + std::to_string(id));
    posted.emplace_back("redraw");
}

void ReferenceCanvas::storeUndoCount(std::int64_t count)
{
    if (count == 0)
        posted.emplace_back("enableUndo true");
    if (count == 5)
        posted.emplace_back("enableUndo false");
    undoCount = count;
}

void ReferenceCanvas::emptyUndoStack()
{
    posted.emplace_back("enableUndo false");
    undoStack.clear();
}

void ReferenceCanvas::popUndo()
{
    undoStack.pop_back();
    if (undoStack.empty())
        posted.emplace_back("enableUndo false");
}

void ReferenceCanvas::announceRedo()
{
    if (redoStack.empty())
        posted.emplace_back("enableRedo false");
    else if (redoStack.size() < 6)
        posted.emplace_back("enableRedo true");
}

void ReferenceCanvas::record(Action action, const Item &item)
{
    if (!undoStack.empty() && undoStack.back().action == Action::clear)
        emptyUndoStack();
    storeUndoCount(0);
    undoStack.push_back({ action, item });
}

void ReferenceCanvas::beginStroke(std::int64_t id, int line, double x)
{
    m_geometry[id] = { line, {} };
    strokes.push_back({ true, id, x });
    record(Action::draw, strokes.back());
    redoStack.clear();
    announceRedo();
}

void ReferenceCanvas::extendStroke(double x)
{
    if (strokes.empty())
        return;
    Item &newest = strokes.back();
    m_geometry[newest.id].stretches.emplace_back(std::minmax(newest.startX, x));
    newest.startX = x;
}

bool ReferenceCanvas::isHit(const Item &stroke, int line, double x, double aboveLine) const
{
    const Geometry &shape = m_geometry.at(stroke.id);
    if (shape.line != line)
        return false;
    for (const auto &[left, right] : shape.stretches) {
        const double beside = std::max({ 0.0, left - x, x - right });
        if (beside * beside + aboveLine * aboveLine <= 2.5 * 2.5)
            return true;
    }
    return false;
}

bool ReferenceCanvas::eraseAt(int line, double x, double aboveLine)
{
    for (std::size_t index = 0; index < strokes.size(); ++index) {
        if (!isHit(strokes[index], line, x, aboveLine))
            continue;
        record(Action::erase, strokes[index]);
        redoStack.clear();
        announceRedo();
        strokes.erase(strokes.begin() + static_cast<std::ptrdiff_t>(index));
        return true;
    }
    return false;
}

void ReferenceCanvas::addTextBox(std::int64_t id)
{
    textBoxes.push_back({ false, id, 0 });
    record(Action::draw, textBoxes.back());
}

void ReferenceCanvas::deleteTextBox(std::int64_t id)
{
    const Item item { false, id, 0 };
    if (remove(item))
        undoStack.push_back({ Action::erase, item });
}

void ReferenceCanvas::clear()
{
    emptyUndoStack();
    redoStack.clear();
    announceRedo();
    for (const Item &item : strokes)
        undoStack.push_back({ Action::clear, item });
    for (const Item &item : textBoxes)
        undoStack.push_back({ Action::clear, item });
    storeUndoCount(0);
    strokes.clear();
    textBoxes.clear();
}

void ReferenceCanvas::undo()
{
    if (undoStack.empty())
        return;
    storeUndoCount(undoCount + 1);
    if (undoStack.back().action == Action::clear) {
        strokes.clear();
        textBoxes.clear();
        while (!undoStack.empty() && undoStack.back().action == Action::clear)
            undoOne(Record(undoStack.back()));
    } else {
        undoOne(Record(undoStack.back()));
    }
    posted.emplace_back("redraw");
}

void ReferenceCanvas::undoOne(const Record &record)
{
    if (record.action != Action::draw)
        arrayOf(record.item).push_back(record.item);
    else if (remove(record.item) && !record.item.isStroke)
        removeTextBoxFromView(record.item.id);
    redoStack.push_back(record);
    announceRedo();
    popUndo();
}

void ReferenceCanvas::redo()
{
    if (redoStack.empty())
        return;
    storeUndoCount(0);
    const bool isGroup = redoStack.back().action == Action::clear;
    do {
        redoOne(Record(redoStack.back()));
    } while (isGroup && !redoStack.empty() && redoStack.back().action == Action::clear);
    posted.emplace_back("redraw");
}

void ReferenceCanvas::redoOne(const Record &record)
{
    if (record.action == Action::draw) {
        arrayOf(record.item).push_back(record.item);
    } else if (record.action == Action::erase) {
        if (remove(record.item) && !record.item.isStroke)
            removeTextBoxFromView(record.item.id);
    } else if (record.item.isStroke && !strokes.empty()) {
        strokes.pop_back();
    } else if (!textBoxes.empty()) {
        textBoxes.pop_back();
        removeTextBoxFromView(record.item.id);
    }
    undoStack.push_back(record);
    redoStack.pop_back();
    announceRedo();
}

} // namespace penwick::test
