// SPDX-License-Identifier: MIT
// What an input method has half composed in an editor, and is not yet part of its text.
#pragma once

#include <QInputMethodEvent>
#include <QList>
#include <QString>

class QTextEdit;

namespace penwick {

/// The composition in the text, wherever it stands; empty where there is none.
[[nodiscard]] QString compositionIn(const QTextEdit &editor);

/// `attributes` for a composition of which only the first `length` characters are shown.
[[nodiscard]] QList<QInputMethodEvent::Attribute> attributesWithin(
    QList<QInputMethodEvent::Attribute> attributes, int length);

/// Takes out what is half composed in another line than the insertion point's. An input method says
/// all of its composition each time, and the editor puts it where the insertion point is then.
void dropCompositionBesideCaret(QTextEdit &editor);

/// Makes the composition part of the text. An editor that became read-only would drop it.
void commitCompositionIn(QTextEdit &editor);

} // namespace penwick
