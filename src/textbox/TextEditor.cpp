// SPDX-License-Identifier: MIT
#include "textbox/TextEditor.h"

#include "textbox/TextBoxLayout.h"
#include "textbox/TextComposition.h"
#include "textbox/TextEditing.h"

#include <QAbstractTextDocumentLayout>
#include <QMimeData>
#include <QScrollBar>
#include <QTextDocument>
#include <QTextFrame>
#include <QTextOption>

#include <algorithm>

namespace penwick {

namespace {

// The text that gives way to what is committed, as `at` stands now, selected.
QTextCursor replacedBy(const QInputMethodEvent &event, const QTextCursor &at)
{
    if (event.replacementLength() == 0)
        return at;
    QTextCursor replaced = at;
    const int last = replaced.document()->characterCount() - 1;
    const int start = std::clamp(at.selectionStart() + event.replacementStart(), 0, last);
    replaced.setPosition(start);
    replaced.setPosition(
        std::clamp(start + event.replacementLength(), start, last), QTextCursor::KeepAnchor);
    return replaced;
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
    viewport()->setAutoFillBackground(false);
    setAcceptRichText(false); // whatever is pasted arrives in the editor's own font and colour
    setWordWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    setCursorWidth(0); // the caret is painted here

    connect(document(), &QTextDocument::contentsChanged, this, &TextEditor::writingChanged);
    connect(this, &QTextEdit::cursorPositionChanged, &m_caret, &TextCaret::restart);
    // A new box is lower than a line of a large font; it grows with the first letter.
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, [this] {
        if (isEmpty())
            verticalScrollBar()->setValue(0);
    });
}

TextEditor::~TextEditor() = default;

void TextEditor::setInk(const QFont &font, const QColor &color, platform::Point origin)
{
    m_look.reset(); // what follows is to be heard
    setFont(font);
    document()->setDefaultFont(font); // a style sheet's would be the widget's
    QTextCharFormat ink;
    ink.setForeground(color);
    textCursor().setBlockCharFormat(ink); // lasts when all of the text is deleted
    setTextColor(color);
    QPalette colors = palette();
    colors.setColor(QPalette::Text, color);
    setPalette(colors);
    m_look.emplace(*this);
    m_caret.setColor(color);

    document()->setDocumentMargin(0.0);
    QTextFrameFormat margins = document()->rootFrame()->frameFormat();
    margins.setLeftMargin(origin.x);
    margins.setRightMargin(origin.x);
    margins.setTopMargin(origin.y);
    margins.setBottomMargin(bottomPadding);
    document()->rootFrame()->setFrameFormat(margins);
    document()->clearUndoRedoStacks(); // the user did none of this
}

void TextEditor::setEditable(bool editable)
{
    setReadOnly(!editable);
    if (editable && hasFocus())
        m_caret.show();
    else
        m_caret.hide();
}

bool TextEditor::isEmpty() const
{
    return document()->isEmpty();
}

// Not by the editor itself: between whole scales it paints its own caret, however thin it is told
// to be.
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
    context.palette = palette();
    context.clip = part.translated(scrolled);
    context.selections = selections;
    painter.translate(-scrolled);
    painter.setClipRect(context.clip, Qt::IntersectClip);
    document()->documentLayout()->draw(&painter, context);
}

// The pointer

// Pressing is only half of what the editor does with a press: it selects text as the pointer goes
// on, and on X11 the wheel's button pastes.
void TextEditor::mousePressEvent(QMouseEvent *event)
{
    prepareForPress(*this, *event);
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
    if (verticalScrollBar()->maximum() == 0 || event->modifiers().testFlag(Qt::ControlModifier))
        event->ignore();
    else // not by the editor, which would change its font's size where it is read-only
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
    if (!refuses(*event) && !redoIfAsked(*this, *event))
        ViewOf::keyPressEvent(event);
}

TextRoom TextEditor::room() const
{
    TextRoom room = roomAt(textCursor());
    // What is half composed has its place already.
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

// The editor's own would read an offer that has no format at all as if it had one, and crash.
void TextEditor::insertFromMimeData(const QMimeData *source)
{
    if (!isEditable() || !source || !source->hasText())
        return;
    const QString text = source->text();
    const QString taken = fittingPart(text, room());
    if (!taken.isEmpty())
        insertPlainText(taken);
    ensureCursorVisible();
    if (taken.size() < text.size())
        Q_EMIT refused(static_cast<int>(text.size() - taken.size()));
}

void TextEditor::inputMethodEvent(QInputMethodEvent *event)
{
    dropCompositionBesideCaret(*this);
    TextRoom room = roomAt(replacedBy(*event, textCursor()));
    QString commit = fittingPart(event->commitString(), room);
    // What stands there goes only if all that takes its place comes.
    const bool isKept
        = event->replacementLength() > 0 && commit.size() < event->commitString().size();
    if (isKept) {
        commit.clear();
        room = roomAt(textCursor());
    }
    room.characters -= static_cast<int>(commit.size());
    const QString half = fittingPart(event->preeditString(), room);
    QInputMethodEvent fitting(
        half, attributesWithin(event->attributes(), static_cast<int>(half.size())));
    if (!isKept)
        fitting.setCommitString(commit, event->replacementStart(), event->replacementLength());
    ViewOf::inputMethodEvent(&fitting);
    event->setAccepted(fitting.isAccepted());
    Q_EMIT writingChanged();
    const auto count = (event->commitString().size() - commit.size())
        + (event->preeditString().size() - half.size());
    if (isEditable() && count > 0)
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
