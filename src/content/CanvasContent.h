// SPDX-License-Identifier: MIT
// What is on one canvas: strokes and text boxes, as plain entries.
#pragma once

#include "content/EntryList.h"

#include <penwick/platform/BezierPath.h>
#include <penwick/platform/Geometry.h>

#include <QColor>

#include <cstdint>
#include <memory>
#include <optional>
#include <utility>

namespace penwick {

class TnTextBox; // a widget: history keeps it alive and never looks inside

/// The parameters of a stroke. Points are in the canvas's coordinates.
struct Path
{
    std::optional<platform::Point> startPoint; ///< where the next segment begins
    std::optional<platform::Point> endPoint; ///< never set; kept as a part of the record
    std::optional<QColor> pathColor; ///< alpha already applied; empty: that of an older stroke
};

/// One freehand stroke. The thickness is the path's own line width.
struct StrokeEntry
{
    std::shared_ptr<platform::BezierPath> bPath;
    Path bPathParams;
    std::int64_t pathId = 0; ///< the path's hash()
};

/// Whether both are the same stroke, however much it has grown.
[[nodiscard]] inline bool isSameStroke(const StrokeEntry &a, const StrokeEntry &b)
{
    return a.bPath == b.bPath;
}

/// One text box.
struct TextBoxEntry
{
    std::int64_t textId = 0; ///< the box's hash()
    std::shared_ptr<TnTextBox> textBox;
};

/// The two arrays of a canvas, each oldest first: the drawing order.
///
/// They are values: whoever changes one changes a copy and assigns it. The history of a canvas
/// assigns them through this class; the model, which derives from it, hides the setters from all
/// others.
class CanvasContent
{
public:
    CanvasContent(const CanvasContent &) = delete;
    CanvasContent &operator=(const CanvasContent &) = delete;

    [[nodiscard]] const EntryList<StrokeEntry> &pathArray() const { return m_pathArray; }
    virtual void setPathArray(EntryList<StrokeEntry> strokes) { m_pathArray = std::move(strokes); }
    [[nodiscard]] const EntryList<TextBoxEntry> &textBoxArray() const { return m_textBoxArray; }
    void setTextBoxArray(EntryList<TextBoxEntry> boxes) { m_textBoxArray = std::move(boxes); }

protected:
    CanvasContent() = default;
    ~CanvasContent() = default;

private:
    EntryList<StrokeEntry> m_pathArray;
    EntryList<TextBoxEntry> m_textBoxArray;
};

} // namespace penwick
