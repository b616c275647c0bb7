// SPDX-License-Identifier: MIT
// What the tool bar tells the drawing side.
#pragma once

class QString;

namespace penwick {

/// Receives the choice of a tool or of an option by its identifier. Implemented by a QObject.
class ToolSelectionDelegate
{
public:
    virtual ~ToolSelectionDelegate() = default;

    /// "text", "brush", "eraser", "color", "clear", "state", "undo" or "redo".
    virtual void handleToolSelection(const QString &selectedTool) = 0;
    /// A tool, "#" and a value: "brush#8", "color#red".
    virtual void handleToolOptionSelection(const QString &selectedToolOption) = 0;
};

} // namespace penwick
