// SPDX-License-Identifier: MIT
#include "history/UndoRedoManager.h"

#include "history/NotificationNames.h"
#include "history/SubviewOperation.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/StandardOutput.h"

#include <penwick/platform/NotificationCenter.h>

#include <limits>
#include <utility>

namespace penwick {

namespace {

// After this many undo steps in a row the undo button is disabled. With more undone records than
// this the state of the redo button is no longer posted.
constexpr int offeredSteps = 5;

void post(const QString &name, const QVariant &object = QVariant())
{
    platform::NotificationCenter::defaultCenter().postNotification(name, object);
}

void postButtonState(const QString &key, bool enabled)
{
    post(penwickNotificationKey(), QVariantMap { { key, enabled } });
}

void postEnableUndo(bool enabled)
{
    postButtonState(QStringLiteral("enableUndo"), enabled);
}

void postTextBoxLeaves(std::int64_t textId)
{
    post(drawingCanvasSubviewUpdateNotification(),
        SubviewOperation::removeWithId(textId).toVariant());
    post(drawingViewUpdatedNotification());
}

bool isStroke(const UndoRedoState &record)
{
    return std::holds_alternative<StrokeEntry>(record.element);
}

void appendElement(CanvasContent &content, const Element &element)
{
    if (const auto *stroke = std::get_if<StrokeEntry>(&element)) {
        EntryList<StrokeEntry> strokes = content.pathArray();
        strokes.append(*stroke);
        content.setPathArray(std::move(strokes));
    } else {
        EntryList<TextBoxEntry> boxes = content.textBoxArray();
        boxes.append(std::get<TextBoxEntry>(element));
        content.setTextBoxArray(std::move(boxes));
    }
}

void removeFirstStroke(CanvasContent &content, std::int64_t pathId)
{
    EntryList<StrokeEntry> strokes = content.pathArray();
    const auto index = strokes.firstIndexWhere(
        [pathId](const StrokeEntry &entry) { return entry.pathId == pathId; });
    if (!index)
        return;
    strokes.removeAt(*index);
    content.setPathArray(std::move(strokes));
}

void removeFirstTextBox(CanvasContent &content, std::int64_t textId)
{
    EntryList<TextBoxEntry> boxes = content.textBoxArray();
    const auto index = boxes.firstIndexWhere(
        [textId](const TextBoxEntry &entry) { return entry.textId == textId; });
    if (!index)
        return;
    boxes.removeAt(*index);
    content.setTextBoxArray(std::move(boxes));
    postTextBoxLeaves(textId);
}

void removeFirst(CanvasContent &content, const UndoRedoState &record)
{
    if (isStroke(record))
        removeFirstStroke(content, record.elementId);
    else
        removeFirstTextBox(content, record.elementId);
}

void removeLastStroke(CanvasContent &content)
{
    EntryList<StrokeEntry> strokes = content.pathArray();
    strokes.removeLast();
    content.setPathArray(std::move(strokes));
}

void removeLastTextBox(CanvasContent &content)
{
    EntryList<TextBoxEntry> boxes = content.textBoxArray();
    boxes.removeLast();
    content.setTextBoxArray(std::move(boxes));
}

void printNotAvailable()
{
    platform::printLine("Undo Not Available!"); // the same text for redo is intended
}

} // namespace

void UndoRedoManager::setDrawingCanvasModel(std::weak_ptr<CanvasContent> model)
{
    m_drawingCanvasModel = std::move(model);
}

void UndoRedoManager::setUndoStack(RecordStack stack)
{
    if (stack.isEmpty())
        postEnableUndo(false);
    m_undoStack = std::move(stack);
}

void UndoRedoManager::pushUndo(const UndoRedoState &record)
{
    m_undoStack.append(record); // not empty any more, so there is nothing to post
}

void UndoRedoManager::popUndo()
{
    if (m_undoStack.size() == 1)
        setUndoStack({});
    else
        m_undoStack.removeLast();
}

void UndoRedoManager::setRedoStack(RecordStack stack)
{
    m_redoStack = std::move(stack);
    announceRedoState();
}

void UndoRedoManager::pushRedo(const UndoRedoState &record)
{
    m_redoStack.append(record);
    announceRedoState();
}

void UndoRedoManager::popRedo()
{
    m_redoStack.removeLast();
    announceRedoState();
}

void UndoRedoManager::announceRedoState() const
{
    if (m_redoStack.size() <= offeredSteps)
        postButtonState(QStringLiteral("enableRedo"), !m_redoStack.isEmpty());
}

void UndoRedoManager::setUndoCount(std::int64_t count)
{
    if (count == 0)
        postEnableUndo(true);
    else if (count == offeredSteps)
        postEnableUndo(false);
    m_undoCount = count;
}

CanvasContent &UndoRedoManager::requireContent() const
{
    // A plain reference is safe: undoAction() and redoAction() keep the content alive.
    return *platform::require(m_drawingCanvasModel.lock(), "the history's canvas model is gone");
}

void UndoRedoManager::undoAction()
{
    if (m_undoStack.isEmpty())
        return;
    const auto aliveUntilDone = m_drawingCanvasModel.lock(); // and this history, which it owns
    if (m_undoCount == std::numeric_limits<std::int64_t>::max())
        platform::fatalError("the number of undo steps overflows");
    setUndoCount(m_undoCount + 1);

    const UndoRedoState record = m_undoStack.last();
    switch (record.actionAssociated) {
    case ActionType::draw:
        undoDraw(record);
        break;
    case ActionType::erase:
        undoErase(record);
        break;
    case ActionType::clear:
        undoClear();
        break;
    case ActionType::undo:
    case ActionType::redo:
        printNotAvailable();
        return;
    }
    post(drawingViewUpdatedNotification());
}

void UndoRedoManager::undoDraw(const UndoRedoState &record)
{
    removeFirst(requireContent(), record);
    pushRedo(record);
    popUndo();
}

void UndoRedoManager::undoErase(const UndoRedoState &record)
{
    // The element comes back at the end of its array, not at its old place, and so lies on top of
    // what was drawn meanwhile.
    appendElement(requireContent(), record.element);
    pushRedo(record);
    popUndo();
}

void UndoRedoManager::undoClear()
{
    CanvasContent &content = requireContent();
    content.setPathArray({});
    content.setTextBoxArray({});

    const RecordStack records = m_undoStack;
    for (int index = records.size() - 1; index >= 0; --index) {
        const UndoRedoState &record = records[index];
        if (record.actionAssociated != ActionType::clear)
            break;
        appendElement(content, record.element);
        pushRedo(record);
        popUndo();
    }
}

void UndoRedoManager::redoAction()
{
    if (m_redoStack.isEmpty())
        return;
    const auto aliveUntilDone = m_drawingCanvasModel.lock(); // and this history, which it owns
    setUndoCount(0);

    const UndoRedoState record = m_redoStack.last();
    switch (record.actionAssociated) {
    case ActionType::draw:
        redoDraw(record);
        break;
    case ActionType::erase:
        redoErase(record);
        break;
    case ActionType::clear:
        redoClear();
        break;
    case ActionType::undo:
    case ActionType::redo:
        printNotAvailable();
        return;
    }
    post(drawingViewUpdatedNotification());
}

void UndoRedoManager::redoDraw(const UndoRedoState &record)
{
    appendElement(requireContent(), record.element);
    pushUndo(record);
    popRedo();
}

void UndoRedoManager::redoErase(const UndoRedoState &record)
{
    removeFirst(requireContent(), record);
    pushUndo(record);
    popRedo();
}

void UndoRedoManager::redoClear()
{
    const RecordStack records = m_redoStack;
    for (int index = records.size() - 1; index >= 0; --index) {
        if (records[index].actionAssociated != ActionType::clear)
            break;
        redoClearOf(records[index]);
    }
}

void UndoRedoManager::redoClearOf(const UndoRedoState &record)
{
    // The entry is found by its position at the end, not by its identifier: undoing the clear
    // appended the entries in the order in which it pushed these records.
    CanvasContent &content = requireContent();
    if (isStroke(record) && !content.pathArray().isEmpty()) {
        removeLastStroke(content);
    } else if (!content.textBoxArray().isEmpty()) {
        removeLastTextBox(content);
        postTextBoxLeaves(m_redoStack.last().elementId);
    }
    pushUndo(record);
    popRedo();
}

} // namespace penwick
