// SPDX-License-Identifier: MIT
// A model with its history, and an ear on all that is posted.
#pragma once

#include "appearance/PenwickBundle.h"
#include "canvas/DrawingCanvasModel.h"
#include "history/UndoRedoManager.h"
#include "support/NotificationRecorder.h"
#include "textbox/TextBoxDelegate.h"
#include "textbox/TnTextBox.h"

#include <gtest/gtest.h>

#include <QColor>
#include <QObject>

#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace penwick::test {

using platform::Point;
using Ids = std::vector<std::int64_t>;
using Posts = std::vector<std::string>;
using Kind = platform::BezierPath::ElementKind;

/// The owner of text boxes, in name only.
class Owner final : public QObject, public TextBoxDelegate
{
public:
    void shouldDeleteTheTextBox(std::int64_t /*withHash*/) override { }
};

inline Ids idsOf(const EntryList<StrokeEntry> &entries)
{
    Ids identifiers;
    for (const StrokeEntry &entry : entries)
        identifiers.push_back(entry.pathId);
    return identifiers;
}

inline Ids idsOf(const EntryList<TextBoxEntry> &entries)
{
    Ids identifiers;
    for (const TextBoxEntry &entry : entries)
        identifiers.push_back(entry.textId);
    return identifiers;
}

using Done = std::vector<std::pair<ActionType, std::int64_t>>;

inline Done doneOf(const RecordStack &stack)
{
    Done done;
    for (const UndoRedoState &record : stack)
        done.emplace_back(record.actionAssociated, record.elementId);
    return done;
}

/// An empty model with its history.
class DrawingCanvasModelTest : public ::testing::Test
{
protected:
    DrawingCanvasModelTest()
    {
        // A text box makes its delete button, which needs its pictures.
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        history->setDrawingCanvasModel(model);
        model->setUndoRedoManager(history);
    }

    /// A line of 100 points to the right, five wide. Returns its identifier.
    std::int64_t drawLine(Point start = { 0, 0 })
    {
        model->createPathWithParam(Qt::black, 5.0, start);
        model->updateTheCurrentPath({ start.x + 100, start.y });
        return model->pathArray().last().pathId;
    }

    std::int64_t addTextBox(Point location = { 50, 60 })
    {
        model->createTextBox(location, Qt::red, 24.0, &owner);
        return model->textBoxArray().last().textId;
    }

    /// Leaves one undone stroke on the redo stack; what that posted is not in `recorder` any more.
    void makeSomethingRedoable()
    {
        drawLine({ 0, 500 });
        history->undoAction();
        static_cast<void>(recorder.take());
    }

    std::shared_ptr<DrawingCanvasModel> model = std::make_shared<DrawingCanvasModel>();
    std::shared_ptr<UndoRedoManager> history = std::make_shared<UndoRedoManager>();
    Owner owner;
    NotificationRecorder recorder;
};

} // namespace penwick::test
