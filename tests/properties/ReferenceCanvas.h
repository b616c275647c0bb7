// SPDX-License-Identifier: MIT
// A second canvas with its history, so plain that it can be believed.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace penwick::test {

/// Content as lists of identifiers, history as lists of records, notifications as lines of text.
///
/// Shares no code with the product. All strokes are five points wide and lie on horizontal lines,
/// ten points apart: a stroke's geometry is the line's number and the stretches drawn on it.
class ReferenceCanvas
{
public:
    using Ids = std::vector<std::int64_t>;

    enum class Action
    {
        draw,
        erase,
        clear
    };

    /// One thing on the canvas.
    struct Item
    {
        bool isStroke = true;
        std::int64_t id = 0;
        double startX = 0; ///< where a stroke's next stretch begins
    };

    struct Record
    {
        Action action = Action::draw;
        Item item;
    };

    void beginStroke(std::int64_t id, int line, double x);
    void extendStroke(double x); ///< the newest stroke, along its line
    bool eraseAt(int line, double x, double aboveLine);
    void addTextBox(std::int64_t id);
    void deleteTextBox(std::int64_t id);
    void clear();
    void undo();
    void redo();

    [[nodiscard]] Ids strokeIds() const { return idsOf(strokes); }
    [[nodiscard]] Ids textBoxIds() const { return idsOf(textBoxes); }
    /// The line that the newest stroke lies on.
    [[nodiscard]] int newestLine() const { return m_geometry.at(strokes.back().id).line; }

    std::vector<Item> strokes; // oldest first
    std::vector<Item> textBoxes;
    std::vector<Record> undoStack;
    std::vector<Record> redoStack;
    std::int64_t undoCount = 0;
    std::vector<std::string> posted;

private:
    struct Geometry
    {
        int line = 0;
        std::vector<std::pair<double, double>> stretches;
    };

    [[nodiscard]] static Ids idsOf(const std::vector<Item> &items);
    [[nodiscard]] bool isHit(const Item &stroke, int line, double x, double aboveLine) const;
    [[nodiscard]] std::vector<Item> &arrayOf(const Item &item);
    bool remove(const Item &item);
    void removeTextBoxFromView(std::int64_t id);
    void record(Action action, const Item &item);
    void storeUndoCount(std::int64_t count);
    void emptyUndoStack();
    void popUndo();
    void announceRedo();
    void undoOne(const Record &record);
    void redoOne(const Record &record);

    std::map<std::int64_t, Geometry> m_geometry; // of every stroke that ever was
};

} // namespace penwick::test
