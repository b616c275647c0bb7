// SPDX-License-Identifier: MIT
// One record of the history: what was done to which entry.
#pragma once

#include "content/CanvasContent.h"
#include "content/EntryList.h"

#include <cstdint>
#include <variant>

namespace penwick {

/// What was done. The cases' numbers are fixed, so their order must stay.
enum class ActionType
{
    draw, ///< a stroke or a text box was added
    erase, ///< a stroke or a text box was erased
    clear, ///< the canvas was cleared; one record for each entry that this removed
    undo, ///< never recorded
    redo, ///< never recorded
};

using Element = std::variant<StrokeEntry, TextBoxEntry>;

/// A record, copied whenever it moves between the stacks. Keeps the entry's path or box alive.
struct UndoRedoState
{
    Element element;
    ActionType actionAssociated = ActionType::draw;
    std::int64_t elementId = 0; ///< the entry's pathId or textId
};

/// Records of the history; the last one is on top.
using RecordStack = EntryList<UndoRedoState>;

} // namespace penwick
