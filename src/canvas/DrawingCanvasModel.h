// SPDX-License-Identifier: MIT
// The one truth about what is on a canvas.
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

    /// Extends the newest stroke by one segment, a sub-path of its own. Nothing without strokes.
    void updateTheCurrentPath(platform::Point currentPoint);

    /// Erases the oldest stroke that the point lies on; false if there is none.
    bool performEraseOperationAtLocation(platform::Point eraseLocation);

    /// Where an eraser that goes straight on comes upon strokes on its way.
    [[nodiscard]] Meetings strokesMetOn(const Way &way);

    /// Adds a text box, but to no view. What could be redone stays so, unlike after a stroke.
    /// `delegate` must be a TextBoxDelegate (else the process stops); the box borrows it.
    void createTextBox(platform::Point textBoxLocation, const QColor &fontColor, double fontSize,
        QObject *delegate);

    /// Drops the first text box of that hash and records it, leaving the undo count and what could
    /// be redone alone. Nothing for an unknown hash. The box's view stays where it is.
    void deleteTextBoxWith(std::int64_t hashValue);

    /// Drops everything. Only this can be undone afterwards, never what came before it.
    void clearCanvas();

private:
    // Only the history assigns the arrays; everybody else calls an operation.
    using CanvasContent::setPathArray;
    using CanvasContent::setTextBoxArray;

    [[nodiscard]] UndoRedoManager &requireHistory() const;
    void record(const UndoRedoState &state);
    void forgetWhatCouldBeRedone();

    std::shared_ptr<UndoRedoManager> m_undoRedoManager;
    StrokeIndex m_strokeIndex; // brought up to date before it is asked or a stroke grows
};

} // namespace penwick
