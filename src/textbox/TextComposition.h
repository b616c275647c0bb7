// SPDX-License-Identifier: MIT
// What an input method has half composed in an editor, and is not yet part of its text.
#pragma once

#include <QString>

class QTextEdit;

namespace penwick {

/// The composition in the text, wherever it stands; empty where there is none.
[[nodiscard]] QString compositionIn(const QTextEdit &editor);

/// Makes the composition part of the text. An editor that became read-only would drop it.
void commitCompositionIn(QTextEdit &editor);

} // namespace penwick
