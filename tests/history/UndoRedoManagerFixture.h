// SPDX-License-Identifier: MIT
// A history on content that the test may fill, and an ear on all that is posted.
#pragma once

#include "history/UndoRedoManager.h"
#include "support/NotificationRecorder.h"

#include <penwick/platform/NotificationCenter.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace penwick {

// History never looks inside a text box, so any class will do here.
class TnTextBox
{ };

namespace test {

using Ids = std::vector<std::int64_t>;
using Posts = std::vector<std::string>;

/// Content without a model's operations.
class TestContent final : public CanvasContent
{ };

inline UndoRedoState strokeRecord(ActionType action, std::int64_t identifier)
{
    StrokeEntry entry;
    entry.bPath = std::make_shared<platform::BezierPath>();
    entry.pathId = identifier;
    return { entry, action, identifier };
}

inline UndoRedoState textBoxRecord(ActionType action, std::int64_t identifier)
{
    return { TextBoxEntry { identifier, std::make_shared<TnTextBox>() }, action, identifier };
}

inline RecordStack stackOf(const std::vector<UndoRedoState> &records)
{
    RecordStack stack;
    for (const UndoRedoState &record : records)
        stack.append(record);
    return stack;
}

/// A history that works on content of the test's own.
class UndoRedoManagerTest : public ::testing::Test
{
protected:
    UndoRedoManagerTest() { manager.setDrawingCanvasModel(content); }

    /// Puts the record's entry on the canvas, as if it had just been drawn.
    void putOnCanvas(const UndoRedoState &record)
    {
        if (const auto *stroke = std::get_if<StrokeEntry>(&record.element)) {
            EntryList<StrokeEntry> strokes = content->pathArray();
            strokes.append(*stroke);
            content->setPathArray(strokes);
        } else {
            EntryList<TextBoxEntry> boxes = content->textBoxArray();
            boxes.append(std::get<TextBoxEntry>(record.element));
            content->setTextBoxArray(boxes);
        }
    }

    /// Draws `count` strokes, numbered from 1, without anybody listening.
    void drawStrokes(int count)
    {
        for (int identifier = 1; identifier <= count; ++identifier) {
            const UndoRedoState record = strokeRecord(ActionType::draw, identifier);
            putOnCanvas(record);
            manager.pushUndo(record);
        }
    }

    [[nodiscard]] Ids strokes() const
    {
        Ids identifiers;
        for (const StrokeEntry &entry : content->pathArray())
            identifiers.push_back(entry.pathId);
        return identifiers;
    }

    [[nodiscard]] Ids textBoxes() const
    {
        Ids identifiers;
        for (const TextBoxEntry &entry : content->textBoxArray())
            identifiers.push_back(entry.textId);
        return identifiers;
    }

    [[nodiscard]] static Ids idsOf(const RecordStack &stack)
    {
        Ids identifiers;
        for (const UndoRedoState &record : stack)
            identifiers.push_back(record.elementId);
        return identifiers;
    }

    std::shared_ptr<TestContent> content = std::make_shared<TestContent>();
    UndoRedoManager manager;
    NotificationRecorder recorder;
};

/// Looks at something while a notification is being delivered.
class Onlooker
{
public:
    explicit Onlooker(std::function<void()> look)
    {
        platform::NotificationCenter::defaultCenter().addObserver(
            this, QString(), [look = std::move(look)](const platform::Notification &) { look(); });
    }
    ~Onlooker() { platform::NotificationCenter::defaultCenter().removeObserver(this); }
    Onlooker(const Onlooker &) = delete;
    Onlooker &operator=(const Onlooker &) = delete;
};

} // namespace test
} // namespace penwick
