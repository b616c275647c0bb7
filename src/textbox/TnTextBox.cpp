// SPDX-License-Identifier: MIT
#include "textbox/TnTextBox.h"

#include "appearance/Theme.h"
#include "appearance/ToolCursors.h"
#include "appearance/ViewBorder.h"
#include "platform/foundation/FatalError.h"
#include "textbox/TextBoxFont.h"
#include "textbox/TextBoxGrowth.h"
#include "textbox/TextComposition.h"
#include "textbox/TextEditing.h"

#include <penwick/platform/Window.h>

#include <QMimeData>
#include <QScrollBar>
#include <QTextDocument>
#include <QTextFrame>
#include <QTextOption>

namespace penwick {

namespace {

using platform::Point;
using platform::Rect;

constexpr double sidePadding = 5.0; // points, left and right of the text
constexpr double bottomPadding = 3.0; // points
constexpr double placedBorderWidth = 3.0; // points
constexpr double placedBorderRadius = 1.0; // points
constexpr double dashedBorderWidth = 2.0; // points
constexpr double dash = 5.0; // points
constexpr double gap = 4.0; // points
constexpr double placeholderOpacity = 0.5;
constexpr int placeholderFontSize = 14; // points
constexpr double largestSmallFont = 24.0; // points; the text of larger ones stands higher

QColor faded(QColor color)
{
    color.setAlphaF(static_cast<float>(placeholderOpacity));
    return color;
}

} // namespace

std::shared_ptr<TnTextBox> TnTextBox::create(
    const Rect &frame, double fontSize, const QColor &fontColor)
{
    return platform::makeView<TnTextBox>(frame, fontSize, fontColor);
}

TnTextBox::TnTextBox(const Rect &frame, double fontSize, const QColor &fontColor)
    : m_textFontSize(fontSize)
    , m_textFontColor(fontColor)
    , m_panGesture([this](const auto &gesture) { handleGesture(gesture); })
    , m_caret(*this)
    , m_hiding(*this)
{
    setFrame(frame);
    customizeTextBox();
}

TnTextBox::~TnTextBox() = default;

void TnTextBox::customizeTextBox()
{
    // The two full stops are meant.
    m_placeholderAttributedString = { tr("Type your text here.."), faded(m_textFontColor),
        systemFontOf(placeholderFontSize), Qt::AlignJustify };
    setUpEditor();
    setEditable(true);
    m_hasDashedBorder = true;
    m_deleteTextButton = platform::makeView<DeleteTextBoxButton>(frame());
    connect(m_deleteTextButton.get(), &QAbstractButton::clicked, this, &TnTextBox::deleteTextBox);
    setAccessibleName(tr("Text box"));
}

void TnTextBox::setUpEditor()
{
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    viewport()->setAutoFillBackground(false);
    setAcceptRichText(false); // whatever is pasted arrives in the box's own font and colour
    setWordWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    setCursorWidth(0); // the caret is painted here
    setFont(textFontOf(m_textFontSize));
    QTextCharFormat ink;
    ink.setForeground(m_textFontColor);
    textCursor().setBlockCharFormat(ink); // lasts when all of the text is deleted
    setTextColor(m_textFontColor);
    QPalette colors = palette();
    colors.setColor(QPalette::Text, m_textFontColor);
    setPalette(colors);
    m_caret.setColor(m_textFontColor);

    document()->setDocumentMargin(0.0);
    QTextFrameFormat margins = document()->rootFrame()->frameFormat();
    margins.setLeftMargin(sidePadding);
    margins.setRightMargin(sidePadding);
    margins.setTopMargin(textContainerOrigin().y);
    margins.setBottomMargin(bottomPadding);
    document()->rootFrame()->setFrameFormat(margins);
    document()->clearUndoRedoStacks(); // the user did none of this

    connect(document(), &QTextDocument::contentsChanged, this, &TnTextBox::fitToText);
    connect(this, &QTextEdit::cursorPositionChanged, &m_caret, &TextCaret::restart);
    // A new box is lower than a line of a large font; it grows with the first letter.
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, [this] {
        if (isEmpty())
            verticalScrollBar()->setValue(0);
    });
}

Point TnTextBox::textContainerOrigin() const
{
    return { sidePadding, m_textFontSize <= largestSmallFont ? 6.0 : 3.0 };
}

bool TnTextBox::isEmpty() const
{
    return document()->isEmpty();
}

// Appearance

void TnTextBox::draw(const Rect &dirtyRect)
{
    ViewOf::draw(dirtyRect);
    drawPlaceholder();
    if (hasFocus()) {
        QPainter painter(viewport());
        m_caret.paint(painter);
    }
    if (!m_hasDashedBorder)
        return;
    drawBorder(bounds()); // always whole: the clip alone decides what of it is painted
    showDeleteTextButton();
}

void TnTextBox::drawPlaceholder()
{
    if (!isEmpty() || !compositionIn(*this).isEmpty())
        return;
    const Point origin = textContainerOrigin();
    QPainter painter(viewport());
    painter.setFont(m_placeholderAttributedString.font);
    painter.setPen(m_placeholderAttributedString.foregroundColor);
    painter.drawText(QRectF(origin.x, origin.y, width() - 2 * sidePadding, height() - origin.y),
        static_cast<int>(m_placeholderAttributedString.alignment | Qt::AlignTop),
        m_placeholderAttributedString.string);
}

void TnTextBox::drawBorder(const Rect &rect)
{
    if (rect.height < bounds().height)
        return;
    QPen pen(TnhColors::textBoxEditBorderColor, dashedBorderWidth, Qt::SolidLine, Qt::FlatCap,
        Qt::MiterJoin);
    pen.setDashPattern({ dash / dashedBorderWidth, gap / dashedBorderWidth });
    Painter painter(*this);
    painter.setPen(pen);
    painter.drawRect(QRectF(rect.x + 2, rect.y + 2, rect.width - 3, rect.height - 3));
}

void TnTextBox::showPlacedBorder()
{
    setViewBorder(
        *this, TnhColors::textBoxNormalBorderColor, placedBorderWidth, placedBorderRadius);
}

void TnTextBox::showDeleteTextButton()
{
    if (!m_deleteTextButton)
        return;
    m_deleteTextButton->setFrameOrigin(DeleteTextBoxButton::originFor(frame()));
    m_deleteTextButton->setHidden(false);
    if (superview())
        superview()->addSubview(m_deleteTextButton);
}

// The pointer

void TnTextBox::mouseDown(const platform::MouseEvent &event)
{
    if (event.clickCount == 1 && !isEditable()) {
        m_hasDashedBorder = false;
        addGestureRecognizer(m_panGesture);
        showPlacedBorder();
    } else if (event.clickCount == 2) {
        removeGestureRecognizer(m_panGesture);
        setEditable(true);
        if (platform::Layer *const ownLayer = layer())
            ownLayer->borderWidth = 0.0;
        m_hasDashedBorder = true;
        showDeleteTextButton();
        setNeedsDisplay();
    }
    if (platform::Window *const ownWindow = window())
        ownWindow->makeFirstResponder(this);
    ViewOf::mouseDown(event);
}

void TnTextBox::mouseUp(const platform::MouseEvent &)
{
    if (platform::Window *const ownWindow = window())
        ownWindow->makeFirstResponder(this);
}

void TnTextBox::mouseDragged(const platform::MouseEvent &) { }

void TnTextBox::mouseMoved(const platform::MouseEvent &)
{
    if (!m_pointer || m_pointerIsForText != isEditable()) {
        m_pointerIsForText = isEditable();
        m_pointer = getCursorOfType(
            m_pointerIsForText ? QStringLiteral("Text_Cursor") : QStringLiteral("Move_Cursor"));
    }
    m_pointer->set(*this);
}

void TnTextBox::handleGesture(const platform::PanGestureRecognizer &gesture)
{
    platform::Window *const ownWindow = window();
    if (!ownWindow)
        return;
    const Point location = gesture.locationIn(ownWindow->contentView());
    if (gesture.state() == platform::PanGestureRecognizer::State::Began)
        m_mouseDownPoint = location - frame().origin();
    setFrameOrigin(location - m_mouseDownPoint);
}

// Pressing is only half of what the editor does with a press: it selects text as the pointer goes
// on, and on X11 the wheel's button pastes.
void TnTextBox::mousePressEvent(QMouseEvent *event)
{
    prepareForPress(*this, *event);
    if (event->button() == Qt::MiddleButton && isEditable())
        QTextEdit::mousePressEvent(event); // NOLINT(bugprone-parent-virtual-call): the editor alone
    ViewOf::mousePressEvent(event);
}

void TnTextBox::mouseMoveEvent(QMouseEvent *event)
{
    if (event->buttons().testFlag(Qt::LeftButton) && isEditable()) {
        if (!compositionIn(*this).isEmpty())
            commitCompositionIn(*this);
        QTextEdit::mouseMoveEvent(event); // NOLINT(bugprone-parent-virtual-call): the editor alone
    }
    ViewOf::mouseMoveEvent(event);
}

void TnTextBox::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() == Qt::LeftButton || (event->button() == Qt::MiddleButton && isEditable()))
        QTextEdit::mouseReleaseEvent(event); // NOLINT(bugprone-parent-virtual-call): as above
    ViewOf::mouseReleaseEvent(event);
}

void TnTextBox::wheelEvent(QWheelEvent *event)
{
    event->ignore(); // a read-only editor would change its font's size
}

// Keys

void TnTextBox::keyPressEvent(QKeyEvent *event)
{
    const bool isReturn = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    const bool ends = (isReturn && !event->modifiers().testFlag(Qt::ShiftModifier))
        || event->key() == Qt::Key_Tab || event->key() == Qt::Key_Backtab
        || event->key() == Qt::Key_Escape;
    if (ends) {
        event->accept();
        endEditing();
        return;
    }
    m_caret.restart();
    if (!redoIfAsked(*this, *event))
        ViewOf::keyPressEvent(event);
}

void TnTextBox::keyUp(const platform::KeyEvent &event)
{
    if (event.keyCode == platform::KeyEvent::backspaceKeyCode && !isEditable())
        removeAndReport();
}

// The editor's own would read an offer that has no format at all as if it had one, and crash.
void TnTextBox::insertFromMimeData(const QMimeData *source)
{
    if (!isEditable() || !source || !source->hasText())
        return;
    insertPlainText(source->text());
    ensureCursorVisible();
}

void TnTextBox::inputMethodEvent(QInputMethodEvent *event)
{
    ViewOf::inputMethodEvent(event);
    fitToText();
}

void TnTextBox::focusInEvent(QFocusEvent *event)
{
    ViewOf::focusInEvent(event);
    if (isEditable())
        m_caret.show();
}

void TnTextBox::focusOutEvent(QFocusEvent *event)
{
    ViewOf::focusOutEvent(event);
    m_caret.hide();
}

// Modes

void TnTextBox::setEditable(bool editable)
{
    setReadOnly(!editable);
    if (editable && hasFocus())
        m_caret.show();
    else
        m_caret.hide();
}

void TnTextBox::endEditing()
{
    if (platform::Window *const ownWindow = window())
        ownWindow->makeFirstResponder(superview());
}

bool TnTextBox::resignFirstResponder()
{
    if (m_isTextBoxDeleted)
        return true;
    endEditIn(*this);
    setEditable(false);
    showPlacedBorder();
    m_hasDashedBorder = false;
    addGestureRecognizer(m_panGesture);
    m_deleteTextButton->setHidden(true);
    m_deleteTextButton->restoreImage(); // hidden under the pointer, it may not hear that this left
    if (isEmpty()) {
        m_isTextBoxDeleted = true;
        removeAndReport();
    } else {
        setNeedsDisplay();
    }
    return true;
}

void TnTextBox::viewDidMoveToWindow()
{
    // Brought back by undo, it can be edited and left again.
    if (window())
        m_isTextBoxDeleted = false;
}

void TnTextBox::deleteTextBox()
{
    m_deleteTextButton->restoreImage();
    removeAndReport();
}

void TnTextBox::removeAndReport()
{
    const bool wasDeleted = m_isTextBoxDeleted;
    removeFromSuperview();
    if (m_isTextBoxDeleted && !wasDeleted)
        return; // it was empty, and has reported itself as it resigned
    platform::require(m_textBoxDelegate.get(), "a text box that deletes itself has no delegate")
        ->shouldDeleteTheTextBox(hash());
}

// Size

void TnTextBox::fitToText()
{
    if (m_isFitting || !superview())
        return;
    m_isFitting = true;
    const double canvasWidth = superview()->bounds().width;
    const platform::Size needed = layOutText(*document(), frame(), canvasWidth);
    const Rect fitted = textBoxFrameFor(frame(), needed, canvasWidth);
    if (!(fitted == frame())) {
        setFrame(fitted);
        setNeedsDisplay();
    }
    if (needed.height <= fitted.height)
        verticalScrollBar()->setValue(0);
    else
        ensureCursorVisible();
    m_isFitting = false;
}

} // namespace penwick
