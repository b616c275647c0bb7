// SPDX-License-Identifier: MIT
#include "canvas/DrawingCanvasModel.h"

#include "history/UndoRedoManager.h"
#include "platform/foundation/FatalError.h"
#include "textbox/TextBoxDelegate.h"
#include "textbox/TnTextBox.h"

#include <QColor>
#include <QObject>

#include <optional>
#include <utility>

namespace penwick {

namespace {

// A new text box, in points. Its bottom edge lies below the clicked point, so that the first line
// of text comes to stand beside the pointer.
constexpr double textBoxWidth = 200.0;
constexpr double textBoxHeight = 30.0;
constexpr double textBoxBelowLocation = 24.0;

} // namespace

DrawingCanvasModel::DrawingCanvasModel() = default;
DrawingCanvasModel::~DrawingCanvasModel() = default;

void DrawingCanvasModel::setUndoRedoManager(std::shared_ptr<UndoRedoManager> manager)
{
    m_undoRedoManager = std::move(manager);
}

UndoRedoManager &DrawingCanvasModel::requireHistory() const
{
    return *platform::require(m_undoRedoManager, "the canvas model has no history");
}

void DrawingCanvasModel::setPathArray(EntryList<StrokeEntry> strokes)
{
    CanvasContent::setPathArray(std::move(strokes));
    m_strokeIndex.follow(pathArray());
}

void DrawingCanvasModel::record(const UndoRedoState &state)
{
    UndoRedoManager &history = requireHistory();
    // Once something new is done after a clear, the clear can no longer be undone.
    const RecordStack &done = history.undoStack();
    if (!done.isEmpty() && done.last().actionAssociated == ActionType::clear)
        history.setUndoStack({});
    history.setUndoCount(0);
    history.pushUndo(state);
}

void DrawingCanvasModel::forgetWhatCouldBeRedone()
{
    requireHistory().setRedoStack({});
}

void DrawingCanvasModel::createPathWithParam(
    const QColor &pathColor, double pathThickNess, platform::Point startPoint)
{
    auto path = std::make_shared<platform::BezierPath>();
    path->setLineCapStyle(platform::LineCapStyle::Round);
    path->setLineJoinStyle(platform::LineJoinStyle::Round);
    path->setLineWidth(pathThickNess);
    const std::int64_t pathId = path->hash();
    const StrokeEntry entry { std::move(path), { startPoint, std::nullopt, pathColor }, pathId };

    EntryList<StrokeEntry> strokes = pathArray();
    strokes.append(entry);
    setPathArray(std::move(strokes));
    record({ entry, ActionType::draw, pathId });
    forgetWhatCouldBeRedone();
}

void DrawingCanvasModel::updateTheCurrentPath(platform::Point currentPoint)
{
    if (pathArray().isEmpty())
        return;
    EntryList<StrokeEntry> strokes = pathArray();
    StrokeEntry &current = strokes.mutableLast();
    std::optional<platform::Point> &segmentStart = current.bPathParams.startPoint;
    if (!segmentStart)
        platform::fatalError("the newest stroke has no start point");
    current.bPath->moveToPoint(*segmentStart);
    current.bPath->lineToPoint(currentPoint);
    segmentStart = currentPoint;
    setPathArray(std::move(strokes));
}

bool DrawingCanvasModel::performEraseOperationAtLocation(platform::Point eraseLocation)
{
    const auto hit = m_strokeIndex.oldestAt(eraseLocation);
    if (!hit)
        return false;
    const StrokeEntry entry = pathArray()[*hit];
    record({ entry, ActionType::erase, entry.pathId });
    forgetWhatCouldBeRedone();
    EntryList<StrokeEntry> strokes = pathArray();
    strokes.removeAt(*hit);
    setPathArray(std::move(strokes));
    return true;
}

void DrawingCanvasModel::createTextBox(
    platform::Point textBoxLocation, const QColor &fontColor, double fontSize, QObject *delegate)
{
    const platform::Rect frame { textBoxLocation.x, textBoxLocation.y - textBoxBelowLocation,
        textBoxWidth, textBoxHeight };
    const std::shared_ptr<TnTextBox> textBox = TnTextBox::create(frame, fontSize, fontColor);
    textBox->setTextBoxDelegate(platform::require(dynamic_cast<TextBoxDelegate *>(delegate),
        "a text box's delegate is no owner of text boxes"));
    const TextBoxEntry entry { textBox->hash(), textBox };

    EntryList<TextBoxEntry> boxes = textBoxArray();
    boxes.append(entry);
    setTextBoxArray(std::move(boxes));
    record({ entry, ActionType::draw, entry.textId });
}

void DrawingCanvasModel::deleteTextBoxWith(std::int64_t hashValue)
{
    EntryList<TextBoxEntry> boxes = textBoxArray();
    const auto found = boxes.firstIndexWhere(
        [hashValue](const TextBoxEntry &entry) { return entry.textId == hashValue; });
    if (!found)
        return;
    requireHistory().pushUndo({ boxes[*found], ActionType::erase, hashValue });
    boxes.removeAt(*found);
    setTextBoxArray(std::move(boxes));
}

void DrawingCanvasModel::clearCanvas()
{
    UndoRedoManager &history = requireHistory();
    history.setUndoStack({});
    history.setRedoStack({});
    for (const StrokeEntry &entry : pathArray())
        history.pushUndo({ entry, ActionType::clear, entry.pathId });
    for (const TextBoxEntry &entry : textBoxArray())
        history.pushUndo({ entry, ActionType::clear, entry.textId });
    history.setUndoCount(0);
    setPathArray({});
    setTextBoxArray({});
}

} // namespace penwick
