// SPDX-License-Identifier: MIT
#include "textbox/TextEditor.h"

#include "textbox/TextBoxLayout.h"
#include "textbox/TextComposition.h"
#include "textbox/TextKeys.h"
#include "textbox/TextSelection.h"

#include <QAbstractTextDocumentLayout>
#include <QMimeData>
#include <QScrollBar>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextFrame>
#include <QTextLayout>

#include <algorithm>

namespace penwick {

namespace {

// What an input method replaces by what it commits, counted from the beginning of what is selected.
struct Replacement
{
    int start;
    int length;
};

// What `event` asks to replace beside `at`, as far as there is text. The toolkit would replace
// nothing at all where a part of it is missing, and put the commit beside it.
Replacement replacementOf(const QInputMethodEvent &event, const QTextCursor &at)
{
    const int first = at.selectionStart();
    const int last = at.document()->characterCount() - 1;
    const int start = std::clamp(first + event.replacementStart(), 0, last);
    const int end = std::clamp(start + event.replacementLength(), start, last);
    return { start - first, end - start };
}

// A cursor that selects what is replaced; `at` itself if that is nothing.
QTextCursor replacedBy(const Replacement &replacement, const QTextCursor &at)
{
    if (replacement.length == 0)
        return at;
    QTextCursor replaced = at;
    replaced.setPosition(at.selectionStart() + replacement.start);
    replaced.setPosition(replaced.position() + replacement.length, QTextCursor::KeepAnchor);
    return replaced;
}

// The strips of `part` that the lines of `text` take.
QList<QRectF> linesIn(const QTextDocument &text, const QRectF &part)
{
    QList<QRectF> lines;
    for (QTextBlock block = text.begin(); block.isValid(); block = block.next()) {
        const QRectF paragraph = text.documentLayout()->blockBoundingRect(block);
        for (int number = 0; number < block.layout()->lineCount(); ++number) {
            const QTextLine line = block.layout()->lineAt(number);
            const QRectF strip(
                part.left(), paragraph.top() + line.y(), part.width(), line.height());
            if (strip.intersects(part))
                lines.push_back(strip & part);
        }
    }
    return lines;
}

} // namespace

TextEditor::TextEditor(QTextDocument *text, QWidget *parent)
    : ViewOf(parent)
    , m_caret(*this)
    , m_hiding(*this)
    , m_selection(*this)
{
    if (text)
        setDocument(text);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setAcceptRichText(false); // whatever is pasted arrives in the editor's own font and colour
    setCursorWidth(0); // the caret is painted here

    connect(document(), &QTextDocument::contentsChanged, this, &TextEditor::writingChanged);
    connect(this, &QTextEdit::cursorPositionChanged, &m_caret, &TextCaret::restart);
    // A new box is less high than a line of a large font and grows with the first letter. Until
    // then it must not scroll.
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, [this] {
        if (isEmpty())
            verticalScrollBar()->setValue(0);
    });
}

TextEditor::~TextEditor() = default;

void TextEditor::setInk(const QFont &font, const QColor &color, platform::Point origin)
{
    setFont(font);
    document()->setDefaultFont(font); // the widget's may be a style sheet's, or kept from it
    QTextCharFormat ink;
    ink.setForeground(color);
    QTextCursor all(document());
    all.select(QTextCursor::Document);
    all.mergeBlockCharFormat(ink); // stays when all text is deleted
    all.mergeCharFormat(ink);
    setTextColor(color);
    m_look.emplace(*this);
    m_caret.setColor(color);

    document()->setDocumentMargin(0.0);
    QTextFrameFormat margins = document()->rootFrame()->frameFormat();
    margins.setLeftMargin(origin.x);
    margins.setRightMargin(origin.x);
    margins.setTopMargin(origin.y);
    margins.setBottomMargin(bottomPadding);
    document()->rootFrame()->setFrameFormat(margins);
    document()->clearUndoRedoStacks(); // the user must not undo any of this
}

void TextEditor::setEditable(bool editable)
{
    if (!editable) {
        endEdit();
        return;
    }
    setReadOnly(false);
    if (hasFocus())
        m_caret.show();
}

void TextEditor::endEdit()
{
    commitCompositionIn(*this); // an editor that became read-only would drop it
    clearSelectionIn(*this);
    document()->clearUndoRedoStacks();
    m_hiding.closeMenu(); // what it offers is not possible any more
    setReadOnly(true);
    m_caret.hide();
    verticalScrollBar()->setValue(0);
}

bool TextEditor::isEmpty() const
{
    return document()->isEmpty();
}

bool TextEditor::isBlank() const
{
    return isEmpty() && compositionIn(*this).isEmpty();
}

// QTextEdit does not paint here, because at a scale such as 1.5 it shows its own caret even with a
// width of 0.
void TextEditor::draw(const platform::Rect &dirtyRect)
{
    QPainter painter(viewport());
    painter.save();
    paintText(painter, toSurface(dirtyRect), selections());
    painter.restore();
    if (hasFocus())
        m_caret.paint(painter);
}

QList<TextEditor::Selection> TextEditor::selections() const
{
    if (!textCursor().hasSelection())
        return {};
    const auto group = hasFocus() ? QPalette::Active : QPalette::Inactive;
    QTextCharFormat format;
    format.setBackground(palette().brush(group, QPalette::Highlight));
    format.setForeground(palette().brush(group, QPalette::HighlightedText));
    return { { textCursor(), format } };
}

void TextEditor::paintText(
    QPainter &painter, const QRectF &part, const QList<Selection> &selections) const
{
    const QPointF scrolled(horizontalScrollBar()->value(), verticalScrollBar()->value());
    QAbstractTextDocumentLayout::PaintContext context;
    context.clip = part.translated(scrolled);
    context.selections = selections;
    painter.translate(-scrolled);
    painter.setClipRect(context.clip, Qt::IntersectClip);
    if (selections.isEmpty())
        return document()->documentLayout()->draw(&painter, context);
    // Line by line: the toolkit clips what is selected by the outline of it all, and a clip of many
    // lines, applied again for every run of letters of one script, took most of a tenth of a
    // second.
    for (const QRectF &line : linesIn(*document(), context.clip)) {
        painter.save();
        painter.setClipRect(line, Qt::IntersectClip);
        context.clip = line;
        document()->documentLayout()->draw(&painter, context);
        painter.restore();
    }
}

// The pointer

// To be called before QTextEdit hears of a press; the right button, which opens the menu, changes
// nothing. A composition becomes text, because QTextEdit would count positions as if it were text
// already. The left button puts the caret where it is pressed, which clears the selection:
// QTextEdit would drag selected text in an event loop of its own, in which the host may end the
// session.
void TextEditor::prepareForPress(const QMouseEvent &press)
{
    if (press.button() == Qt::RightButton)
        return;
    commitCompositionIn(*this);
    // A press with Shift alone extends the selection; QTextEdit does that itself.
    if (press.button() == Qt::LeftButton && press.modifiers() != Qt::ShiftModifier)
        setTextCursor(cursorForPosition(press.position().toPoint()));
}

// A view takes the left button alone, and a text box gives QTextEdit none of its drags and
// releases. QTextEdit needs them nevertheless: it selects text as the pointer moves on, and on X11
// it pastes with the middle button.
void TextEditor::mousePressEvent(QMouseEvent *event)
{
    prepareForPress(*event);
    if (event->button() == Qt::MiddleButton && isEditable())
        QTextEdit::mousePressEvent(event); // NOLINT(bugprone-parent-virtual-call): the editor alone
    ViewOf::mousePressEvent(event);
}

void TextEditor::mouseMoveEvent(QMouseEvent *event)
{
    if (event->buttons().testFlag(Qt::LeftButton) && isEditable()) {
        if (!compositionIn(*this).isEmpty())
            commitCompositionIn(*this);
        QTextEdit::mouseMoveEvent(event); // NOLINT(bugprone-parent-virtual-call): the editor alone
    }
    ViewOf::mouseMoveEvent(event);
}

void TextEditor::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() == Qt::LeftButton || (event->button() == Qt::MiddleButton && isEditable()))
        QTextEdit::mouseReleaseEvent(event); // NOLINT(bugprone-parent-virtual-call): as above
    ViewOf::mouseReleaseEvent(event);
}

void TextEditor::wheelEvent(QWheelEvent *event)
{
    if (event->modifiers().testFlag(Qt::ControlModifier))
        event->ignore();
    else // a read-only QTextEdit would change the size of its font
        QAbstractScrollArea::wheelEvent(event); // NOLINT(bugprone-parent-virtual-call): as said
}

// Keys

void TextEditor::keyPressEvent(QKeyEvent *event)
{
    if (endsEditing(*event)) {
        event->accept();
        if (event->key() == Qt::Key_Escape && !compositionIn(*this).isEmpty())
            commitCompositionIn(*this);
        else
            Q_EMIT endAsked();
        return;
    }
    m_caret.restart();
    if (refuses(*event))
        return;
    if (isEditable() && asksForRedo(*event)) {
        event->accept();
        redo();
    } else {
        ViewOf::keyPressEvent(event);
    }
}

TextRoom TextEditor::room() const
{
    TextRoom room = roomAt(textCursor());
    // The composition will be text soon, so its room is taken already.
    const auto composed = static_cast<int>(compositionIn(*this).size());
    room.characters = std::max(0, room.characters - composed);
    return room;
}

bool TextEditor::refuses(const QKeyEvent &press)
{
    const QString text = isEditable() ? typedBy(press) : QString();
    const auto count = static_cast<int>(text.size() - fittingPart(text, room()).size());
    if (count > 0)
        Q_EMIT refused(count);
    return count > 0;
}

// QTextEdit's own implementation crashes when an offer has no format at all.
void TextEditor::insertFromMimeData(const QMimeData *source)
{
    if (!isEditable())
        return;
    const QString text = source->text();
    const QString taken = fittingPart(text, room());
    if (!taken.isEmpty())
        insertPlainText(taken);
    if (taken.size() < text.size())
        Q_EMIT refused(static_cast<int>(text.size() - taken.size()));
}

// The toolkit's own caret is 0 wide, and a rectangle without a width is never brought from the
// editor's coordinates to the window's: the candidates stood in the corner of the window.
QVariant TextEditor::inputMethodQuery(Qt::InputMethodQuery query) const
{
    QVariant answer = ViewOf::inputMethodQuery(query);
    if (query != Qt::ImCursorRectangle && query != Qt::ImAnchorRectangle)
        return answer;
    QRectF place = answer.toRectF();
    place.setWidth(caretWidth);
    return place;
}

// The toolkit would write into a read-only editor too, and an input method may be late: what it
// commits comes some time after the key, when the edit may have ended.
void TextEditor::inputMethodEvent(QInputMethodEvent *event)
{
    if (!isEditable()) {
        event->ignore();
        return;
    }
    dropCompositionBesideCaret(*this);
    const Replacement replacement = replacementOf(*event, textCursor());
    TextRoom room = roomAt(replacedBy(replacement, textCursor()));
    QString commit = fittingPart(event->commitString(), room);
    // Text is replaced only if there is room for all that replaces it.
    const bool isKept = replacement.length > 0 && commit.size() < event->commitString().size();
    if (isKept) {
        commit.clear();
        room = roomAt(textCursor());
    }
    room.characters -= static_cast<int>(commit.size());
    const QString half = fittingPart(event->preeditString(), room);
    QInputMethodEvent fitting(
        half, attributesWithin(event->attributes(), static_cast<int>(half.size())));
    if (!isKept)
        fitting.setCommitString(commit, replacement.start, replacement.length);
    ViewOf::inputMethodEvent(&fitting);
    const auto count = (event->commitString().size() - commit.size())
        + (event->preeditString().size() - half.size());
    if (count > 0)
        Q_EMIT refused(static_cast<int>(count));
}

void TextEditor::focusInEvent(QFocusEvent *event)
{
    ViewOf::focusInEvent(event);
    if (isEditable())
        m_caret.show();
}

void TextEditor::focusOutEvent(QFocusEvent *event)
{
    ViewOf::focusOutEvent(event);
    m_caret.hide();
}

} // namespace penwick
