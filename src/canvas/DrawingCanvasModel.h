// SPDX-License-Identifier: MIT
// What is on a canvas; the view only has copies of it.
#pragma once

#include "content/CanvasContent.h"
#include "strokes/StrokeIndex.h"

#include <penwick/platform/Geometry.h>

#include <cstdint>
#include <memory>

class QColor;
class QObject;

namespace penwick {

class UndoRedoManager;
struct UndoRedoState;

/// The strokes and text boxes of one canvas, their history, and every way to change them.
///
/// Each operation changes the arrays and writes the record into the history. It posts nothing
/// itself (the history's properties do, before the operation returns) and shows nothing: that is
/// the caller's part. Points are in the canvas's coordinates. Where a record is to be written and
/// there is no history, the process stops. GUI thread only.
class DrawingCanvasModel final : public CanvasContent
{
public:
    DrawingCanvasModel();
    ~DrawingCanvasModel();

    /// The history of this canvas; none until set. Owned; it refers back weakly.
    [[nodiscard]] const std::shared_ptr<UndoRedoManager> &undoRedoManager() const
    {
        return m_undoRedoManager;
    }
    void setUndoRedoManager(std::shared_ptr<UndoRedoManager> manager);

    /// Begins a stroke without any segment and records it: a whole stroke is one record. The
    /// spelling `pathThickNess` is fixed.
    void createPathWithParam(
        const QColor &pathColor, double pathThickNess, platform::Point startPoint);

    /// Extends the newest stroke by one segment, a sub-path of its own. Does nothing if there is no
    /// stroke.
    void updateTheCurrentPath(platform::Point currentPoint);

    /// Erases the oldest stroke that the point lies on; false if there is none.
    bool performEraseOperationAtLocation(platform::Point eraseLocation);

    /// Which strokes lie where; always of pathArray().
    [[nodiscard]] const StrokeIndex &strokeIndex() const { return m_strokeIndex; }

    /// Adds a text box to the content; the caller adds it to a view. Unlike a new stroke, a new box
    /// leaves what can be redone as it is. `delegate` must be a TextBoxDelegate (else the process
    /// stops); the box borrows it.
    void createTextBox(platform::Point textBoxLocation, const QColor &fontColor, double fontSize,
        QObject *delegate);

    /// Removes the first text box with that hash and records it; the undo count and what can be
    /// redone stay as they are. Does nothing for an unknown hash. The box stays in its view.
    void deleteTextBoxWith(std::int64_t hashValue);

    /// Removes everything. Afterwards only the clearing itself can be undone, nothing before it.
    void clearCanvas();

private:
    // Only the history assigns the arrays; everybody else calls an operation.
    void setPathArray(EntryList<StrokeEntry> strokes) override;
    using CanvasContent::setTextBoxArray;

    [[nodiscard]] UndoRedoManager &requireHistory() const;
    void record(const UndoRedoState &state);
    void forgetWhatCouldBeRedone();

    std::shared_ptr<UndoRedoManager> m_undoRedoManager;
    StrokeIndex m_strokeIndex;
};

} // namespace penwick
