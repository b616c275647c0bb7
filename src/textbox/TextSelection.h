// SPDX-License-Identifier: MIT
// What is selected in an editor.
#pragma once

class QTextEdit;

namespace penwick {

/// Clears the selection; the caret stays where it is.
void clearSelectionIn(QTextEdit &editor);

} // namespace penwick
