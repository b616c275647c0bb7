// SPDX-License-Identifier: MIT
#include "textbox/TextComposition.h"

#include "textbox/TextSelection.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QInputMethodEvent>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextEdit>
#include <QTextLayout>

#include <algorithm>

namespace penwick {

namespace {

void forgetComposition(QTextLayout &line)
{
    line.setPreeditArea(-1, {});
    line.clearFormats();
}

void insertComposition(const QTextBlock &block)
{
    QTextLayout &layout = *block.layout();
    QTextCursor there(block);
    // The line may have become shorter since, so that the composition's place is beyond its end.
    there.setPosition(
        block.position() + std::min(layout.preeditAreaPosition(), block.length() - 1));
    const QString left = layout.preeditAreaText();
    forgetComposition(layout);
    there.insertText(left);
}

/// Keeps what input methods say from an editor as long as it lives.
class Silence final : public QObject
{
public:
    explicit Silence(QTextEdit &editor) { editor.installEventFilter(this); }

    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        return event->type() == QEvent::InputMethod;
    }
};

} // namespace

// Every line is searched, because the insertion point may have left the composition's line, as it
// does when something is dropped elsewhere in the text.
QString compositionIn(const QTextEdit &editor)
{
    QString all;
    for (QTextBlock block = editor.document()->begin(); block.isValid(); block = block.next())
        all += block.layout()->preeditAreaText();
    return all;
}

QList<QInputMethodEvent::Attribute> attributesWithin(
    QList<QInputMethodEvent::Attribute> attributes, int length)
{
    for (QInputMethodEvent::Attribute &attribute : attributes) {
        if (attribute.type == QInputMethodEvent::Selection)
            continue; // a selection counts characters of the text, not of the composition
        attribute.start = std::min(attribute.start, length);
        if (attribute.type != QInputMethodEvent::Cursor) // length 0 would hide it
            attribute.length = std::min(attribute.length, length - attribute.start);
    }
    return attributes;
}

void dropCompositionBesideCaret(QTextEdit &editor)
{
    const QTextBlock line = editor.textCursor().block();
    for (QTextBlock block = editor.document()->begin(); block.isValid(); block = block.next()) {
        if (block == line || block.layout()->preeditAreaText().isEmpty())
            continue;
        forgetComposition(*block.layout());
    }
}

void commitCompositionIn(QTextEdit &editor)
{
    if (!compositionIn(editor).isEmpty()) {
        // The toolkit would put the composition in the place of what is selected.
        clearSelectionIn(editor);
    }
    if (editor.hasFocus())
        QGuiApplication::inputMethod()->commit();
    if (compositionIn(editor).isEmpty())
        return;
    // An input method that does not commit when it is told to, as fcitx5 does not, has left its
    // composition here. It is to forget it then, or it would go on with it after the next key; and
    // what it commits as it forgets is text already.
    for (QTextBlock block = editor.document()->begin(); block.isValid(); block = block.next()) {
        if (!block.layout()->preeditAreaText().isEmpty())
            insertComposition(block);
    }
    if (editor.hasFocus()) {
        const Silence silence(editor);
        QGuiApplication::inputMethod()->reset();
    }
}

} // namespace penwick
