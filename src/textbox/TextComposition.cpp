// SPDX-License-Identifier: MIT
#include "textbox/TextComposition.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QInputMethod>
#include <QInputMethodEvent>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextEdit>
#include <QTextLayout>

namespace penwick {

QString compositionIn(const QTextEdit &editor)
{
    return editor.textCursor().block().layout()->preeditAreaText();
}

void commitCompositionIn(QTextEdit &editor)
{
    if (editor.hasFocus())
        QGuiApplication::inputMethod()->commit();
    const QString left = compositionIn(editor);
    if (left.isEmpty())
        return;
    // By an input method that does not commit when it is told to.
    QInputMethodEvent commit;
    commit.setCommitString(left);
    QCoreApplication::sendEvent(&editor, &commit);
}

} // namespace penwick
