// SPDX-License-Identifier: MIT
// The second model's content and history: lists of numbers and lines of text, nothing else.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace penwick::test {

/// A place on the canvas, in points from its bottom left corner.
struct Spot
{
    double x = 0.0;
    double y = 0.0;

    friend bool operator==(const Spot &, const Spot &) = default;
};

/// What is on one canvas, and its history. Shares no code with the product.
///
/// Strokes are called s1, s2 ... and text boxes b1, b2 ... in the order in which they were made.
class PlainDrawing
{
public:
    /// Is told every notification when it is posted.
    using Listener = std::function<void(const std::string &notification)>;

    struct Stroke
    {
        double width = 0.0;
        Spot next; ///< where the next segment begins
        std::vector<std::pair<Spot, Spot>> segments;
    };

    struct Record
    {
        std::string action; ///< draw, erase or clear
        std::string name; ///< of the stroke or box
    };

    void setListener(Listener listener) { m_post = std::move(listener); }

    void beginStroke(Spot start, double width);
    void extendStroke(Spot to);
    bool eraseAt(Spot place);
    /// Where an eraser that goes straight on meets strokes before it arrives, in that order.
    [[nodiscard]] std::vector<Spot> metBetween(Spot from, Spot to) const;
    std::string addBox(); ///< answers its name
    void deleteBox(const std::string &name);
    void clear();
    void undo();
    void redo();

    [[nodiscard]] const std::vector<std::string> &strokes() const { return m_strokes; }
    [[nodiscard]] const std::vector<std::string> &boxes() const { return m_boxes; }
    [[nodiscard]] const std::vector<Record> &undoStack() const { return m_undo; }
    [[nodiscard]] const std::vector<Record> &redoStack() const { return m_redo; }
    [[nodiscard]] std::int64_t undoCount() const { return m_undoCount; }
    [[nodiscard]] const Stroke &stroke(const std::string &name) const { return m_known.at(name); }

private:
    [[nodiscard]] std::vector<std::string> &listOf(const std::string &name);
    bool takeAway(const std::string &name);
    void takeBoxOffCanvas(const std::string &name);
    void record(const std::string &action, const std::string &name);
    void emptyUndo();
    void emptyRedo();
    void popUndo();
    void announceRedo();
    void setUndoCount(std::int64_t count);
    void undoClear();
    void redoClear();

    Listener m_post;
    std::vector<std::string> m_strokes; // oldest first
    std::vector<std::string> m_boxes;
    std::vector<Record> m_undo; // the last one is on top
    std::vector<Record> m_redo;
    std::int64_t m_undoCount = 0;
    std::map<std::string, Stroke> m_known; // every stroke that ever was
    int m_strokesMade = 0;
    int m_boxesMade = 0;
};

} // namespace penwick::test
