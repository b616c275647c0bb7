// SPDX-License-Identifier: MIT
// The history of one canvas and its two commands.
#pragma once

#include "history/UndoRedoState.h"

#include <cstdint>
#include <memory>

namespace penwick {

/// Keeps what was done and what was undone, and replays it on the content.
///
/// It never paints. It posts, on the default notification centre and before the call returns,
/// which button is to be enabled, which text box is to leave the canvas and that the content is to
/// be shown again; see NotificationNames.h. Each assignment to a property posts, exactly once, what
/// the property's setter says; a push or a pop is such an assignment. GUI thread only.
class UndoRedoManager final
{
public:
    UndoRedoManager() = default;
    UndoRedoManager(const UndoRedoManager &) = delete;
    UndoRedoManager &operator=(const UndoRedoManager &) = delete;

    /// The content that undo and redo change. Held weakly, because the content owns its history. A
    /// command that needs the content and finds it gone is a fatal error.
    [[nodiscard]] std::shared_ptr<CanvasContent> drawingCanvasModel() const
    {
        return m_drawingCanvasModel.lock();
    }
    void setDrawingCanvasModel(std::weak_ptr<CanvasContent> model);

    /// What can be undone. The stack has no limit: only the button is disabled after five steps.
    [[nodiscard]] const RecordStack &undoStack() const { return m_undoStack; }
    /// Posts {"enableUndo": false} for an empty stack, before it is stored.
    void setUndoStack(RecordStack stack);
    /// Assigns the stack with `record` added, at a cost that does not depend on its length.
    void pushUndo(const UndoRedoState &record);

    /// What can be redone.
    [[nodiscard]] const RecordStack &redoStack() const { return m_redoStack; }
    /// Stores, then posts {"enableRedo": false} for an empty stack, {"enableRedo": true} for one
    /// to five records, nothing for more.
    void setRedoStack(RecordStack stack);

    /// Undo steps since the last redo or the last newly recorded action.
    [[nodiscard]] std::int64_t undoCount() const { return m_undoCount; }
    /// Posts {"enableUndo": true} for 0 and {"enableUndo": false} for exactly 5, before `count` is
    /// stored.
    void setUndoCount(std::int64_t count);

    /// Takes back the newest record, or the whole group of clear records on top. Does nothing on an
    /// empty stack. For a record of kind undo or redo it only prints "Undo Not Available!".
    void undoAction();

    /// Does the newest undone record, or group of clear records, again. As undoAction() otherwise,
    /// the printed text included.
    void redoAction();

private:
    [[nodiscard]] CanvasContent &requireContent() const;

    void popUndo();
    void pushRedo(const UndoRedoState &record);
    void popRedo();
    void announceRedoState() const;

    void undoDraw(const UndoRedoState &record);
    void undoErase(const UndoRedoState &record);
    void undoClear();
    void redoDraw(const UndoRedoState &record);
    void redoErase(const UndoRedoState &record);
    void redoClear();
    void redoClearOf(const UndoRedoState &record);

    std::weak_ptr<CanvasContent> m_drawingCanvasModel;
    RecordStack m_redoStack;
    RecordStack m_undoStack;
    std::int64_t m_undoCount = 0;
};

} // namespace penwick
