// SPDX-License-Identifier: MIT
#include "textbox/TextKeys.h"

#include <QKeyEvent>

namespace penwick {

namespace {

bool isReturn(const QKeyEvent &press)
{
    return press.key() == Qt::Key_Return || press.key() == Qt::Key_Enter;
}

} // namespace

QString typedBy(const QKeyEvent &press)
{
    if (isReturn(press))
        return QStringLiteral("\n");
    const QString text = press.text();
    if (text.isEmpty())
        return text;
    const QChar first = text.front();
    const auto modifiers = press.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier);
    // Some keyboards write marks of the text's direction with Ctrl and Shift, so these marks are
    // text whatever the modifiers. Ctrl and Alt together are AltGr, which writes; Ctrl alone is a
    // command.
    const bool isWritten = first.category() == QChar::Other_Format
        || (modifiers != Qt::ControlModifier
            && (first.isPrint() || first.category() == QChar::Other_PrivateUse));
    return isWritten ? text : QString();
}

bool endsEditing(const QKeyEvent &press)
{
    return (isReturn(press) && !press.modifiers().testFlag(Qt::ShiftModifier))
        || press.key() == Qt::Key_Tab || press.key() == Qt::Key_Backtab
        || press.key() == Qt::Key_Escape;
}

bool asksForRedo(const QKeyEvent &press)
{
    return press.keyCombination() == (Qt::ControlModifier | Qt::Key_Y);
}

} // namespace penwick
