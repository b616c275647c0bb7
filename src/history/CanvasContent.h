// SPDX-License-Identifier: MIT
// What is on one canvas: strokes and text boxes, as plain entries.
// Declared beside the history because the history works on it; the model is it.
#pragma once

#include "history/EntryList.h"

#include <penwick/platform/BezierPath.h>
#include <penwick/platform/Geometry.h>

#include <QColor>

#include <cstdint>
#include <memory>
#include <optional>

namespace penwick {

class TnTextBox; // a widget: history keeps it alive and never looks inside

/// The parameters of a stroke. Points are in the canvas's coordinates.
struct Path
{
    std::optional<platform::Point> startPoint; ///< where the next segment begins
    std::optional<platform::Point> endPoint; ///< always empty; part of the record nevertheless
    std::optional<QColor> pathColor; ///< alpha already applied; empty: the current stroke colour
};

/// One freehand stroke. The thickness is the path's own line width.
struct StrokeEntry
{
    std::shared_ptr<platform::BezierPath> bPath;
    Path bPathParams;
    std::int64_t pathId = 0; ///< the path's hash, taken once
};

/// One text box.
struct TextBoxEntry
{
    std::int64_t textId = 0; ///< the box's hash, taken once
    std::shared_ptr<TnTextBox> textBox;
};

/// The two arrays of a canvas, each oldest first: the drawing order.
///
/// Everybody may read them, only the model (which derives from this) and its history change them.
class CanvasContent
{
public:
    CanvasContent(const CanvasContent &) = delete;
    CanvasContent &operator=(const CanvasContent &) = delete;

    [[nodiscard]] const EntryList<StrokeEntry> &pathArray() const { return m_pathArray; }
    [[nodiscard]] const EntryList<TextBoxEntry> &textBoxArray() const { return m_textBoxArray; }

protected:
    CanvasContent();
    ~CanvasContent();

    [[nodiscard]] EntryList<StrokeEntry> &mutablePathArray() { return m_pathArray; }
    [[nodiscard]] EntryList<TextBoxEntry> &mutableTextBoxArray() { return m_textBoxArray; }

private:
    friend class UndoRedoManager;

    EntryList<StrokeEntry> m_pathArray;
    EntryList<TextBoxEntry> m_textBoxArray;
};

} // namespace penwick
