// SPDX-License-Identifier: MIT
// The composition of an input method: letters that an editor shows while they are being composed,
// and that are not yet part of its text.
#pragma once

#include <QInputMethodEvent>
#include <QList>
#include <QString>

class QTextEdit;

namespace penwick {

/// The composition, in whichever line it stands; empty if there is none.
[[nodiscard]] QString compositionIn(const QTextEdit &editor);

/// `attributes` for a composition of which only the first `length` characters are shown.
[[nodiscard]] QList<QInputMethodEvent::Attribute> attributesWithin(
    QList<QInputMethodEvent::Attribute> attributes, int length);

/// Removes a composition from every line but the insertion point's. With each of its events an
/// input method sends the whole composition, which the editor shows at the insertion point; what is
/// left in another line would be there twice.
void dropCompositionBesideCaret(QTextEdit &editor);

/// Makes the composition part of the text. An editor that becomes read-only would otherwise lose
/// it.
void commitCompositionIn(QTextEdit &editor);

} // namespace penwick
