// SPDX-License-Identifier: MIT
#include "textbox/TnTextBox.h"

#include "appearance/Theme.h"
#include "appearance/ToolCursors.h"
#include "appearance/ViewBorder.h"
#include "platform/foundation/FatalError.h"
#include "platform/view/ViewHost.h"
#include "textbox/TextBoxFont.h"
#include "textbox/TextBoxLayout.h"
#include "textbox/TextBoxNotice.h"
#include "textbox/TextBoxPlace.h"

#include <QPainterPath>
#include <QTextDocument>

namespace penwick {

namespace {

using platform::Point;
using platform::Rect;

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

TnTextBox::TnTextBox(QTextDocument *textContainer, QWidget *parent)
    : TextEditor(textContainer, parent)
    , m_textFontColor(TextBoxParams::defaultTextFontColor)
{
    connect(this, &TextEditor::writingChanged, this, &TnTextBox::fitToText);
    connect(this, &TextEditor::endAsked, this, &TnTextBox::endEditing);
    connect(this, &TextEditor::refused, this, &TnTextBox::sayRefused);
}

TnTextBox::TnTextBox(QWidget *parent)
    : TnTextBox(nullptr, parent)
{ }

TnTextBox::TnTextBox(const Rect &frame)
    : TnTextBox(nullptr, nullptr)
{
    setFrame(frame);
}

TnTextBox::TnTextBox(const Rect &frame, QTextDocument &textContainer)
    : TnTextBox(&textContainer, nullptr)
{
    setFrame(frame);
}

TnTextBox::TnTextBox(const Rect &frame, double fontSize, const QColor &fontColor)
    : TnTextBox(frame)
{
    m_textFontSize = fontSize;
    m_textFontColor = fontColor;
    customizeTextBox();
}

TnTextBox::~TnTextBox() = default;

void TnTextBox::customizeTextBox()
{
    // The two full stops are intended.
    m_placeholderAttributedString = { tr("Type your text here.."), faded(m_textFontColor),
        systemFontOf(placeholderFontSize), Qt::AlignJustify };
    setInk(textFontOf(m_textFontSize), m_textFontColor, textContainerOrigin());
    m_deleteTextButton = platform::makeView<DeleteTextBoxButton>(frame());
    connect(m_deleteTextButton.get(), &QAbstractButton::clicked, this, &TnTextBox::deleteTextBox);
    setAccessibleName(tr("Text box"));
    beginEditing();
}

platform::PanGestureRecognizer &TnTextBox::panGesture()
{
    if (!m_panGesture)
        m_panGesture = std::make_unique<platform::PanGestureRecognizer>(
            [this](const auto &gesture) { handleGesture(gesture); });
    return *m_panGesture;
}

Point TnTextBox::textContainerOrigin() const
{
    return { sidePadding, m_textFontSize <= largestSmallFont ? 6.0 : 3.0 };
}

// Appearance

void TnTextBox::draw(const Rect &dirtyRect)
{
    TextEditor::draw(dirtyRect);
    drawPlaceholder();
    if (!m_hasDashedBorder)
        return;
    drawBorder(bounds()); // the whole border; the clip decides what of it is painted
    showDeleteTextButton();
}

void TnTextBox::drawContent(QPainter &painter)
{
    paintText(painter, viewport()->rect(), {}); // a selection is no part of the drawing
}

void TnTextBox::drawPlaceholder()
{
    if (!isBlank())
        return;
    const Point origin = textContainerOrigin();
    QPainter painter(viewport());
    painter.setFont(m_placeholderAttributedString.font);
    painter.setPen(m_placeholderAttributedString.foregroundColor);
    painter.drawText(QRectF(origin.x, origin.y, width() - 2 * sidePadding, height() - origin.y),
        static_cast<int>(m_placeholderAttributedString.alignment | Qt::AlignTop),
        m_placeholderAttributedString.string);
}

// QPainter skips the sides of a dashed rectangle that are outside the clip and begins to count its
// dashes after them, so the dashes would move whenever only a part of the box is painted.
// QPainterPathStroker knows no clip.
void TnTextBox::drawBorder(const Rect &rect)
{
    if (rect.height < bounds().height)
        return;
    QPen pen(TnhColors::textBoxEditBorderColor, dashedBorderWidth, Qt::SolidLine, Qt::FlatCap,
        Qt::MiterJoin);
    pen.setDashPattern({ dash / dashedBorderWidth, gap / dashedBorderWidth });
    QPainterPath edge;
    edge.addRect(QRectF(rect.x + 2, rect.y + 2, rect.width - 3, rect.height - 3));
    Painter painter(*this);
    painter.fillPath(QPainterPathStroker(pen).createStroke(edge), pen.color());
}

void TnTextBox::showDeleteTextButton()
{
    if (!m_deleteTextButton || !superview())
        return;
    m_deleteTextButton->setFrameOrigin(DeleteTextBoxButton::originFor(frame()));
    m_deleteTextButton->setHidden(false);
    superview()->addSubview(m_deleteTextButton);
}

// The pointer

void TnTextBox::mouseDown(const platform::MouseEvent &event)
{
    if (event.clickCount == 2)
        beginEditing();
    else if (event.clickCount == 1 && !isEditable())
        becomePlaced();
    if (platform::ViewHost *const ownWindow = window())
        ownWindow->makeFirstResponder(this);
    TextEditor::mouseDown(event);
}

void TnTextBox::mouseUp(const platform::MouseEvent &)
{
    if (platform::ViewHost *const ownWindow = window())
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
    m_pointer->set(surface());
}

void TnTextBox::handleGesture(const platform::PanGestureRecognizer &gesture)
{
    platform::ViewHost *const ownWindow = window();
    if (!ownWindow)
        return;
    const Point location = gesture.locationIn(ownWindow->contentView());
    if (gesture.state() == platform::PanGestureRecognizer::State::Began)
        m_mouseDownPoint = location - frame().origin();
    setFrameOrigin(location - m_mouseDownPoint);
    if (gesture.state() == platform::PanGestureRecognizer::State::Ended && superview())
        setFrame(frameInReach(frame(), superview()->bounds().size()));
}

// Keys

void TnTextBox::keyUp(const platform::KeyEvent &event)
{
    if (event.keyCode == platform::KeyEvent::backspaceKeyCode && !isEditable())
        removeAndReport();
}

// Modes

void TnTextBox::beginEditing()
{
    if (m_panGesture)
        removeGestureRecognizer(*m_panGesture);
    setEditable(true);
    if (platform::Layer *const ownLayer = layer())
        ownLayer->borderWidth = 0.0;
    m_hasDashedBorder = true;
    showDeleteTextButton();
    setNeedsDisplay();
}

void TnTextBox::becomePlaced()
{
    addGestureRecognizer(panGesture());
    setViewBorder(
        *this, TnhColors::textBoxNormalBorderColor, placedBorderWidth, placedBorderRadius);
    m_hasDashedBorder = false;
    if (!m_deleteTextButton)
        return;
    m_deleteTextButton->setHidden(true);
    m_deleteTextButton->restoreImage(); // a hidden button may not hear that the pointer left
}

void TnTextBox::endEditing()
{
    if (platform::ViewHost *const ownWindow = window())
        ownWindow->makeFirstResponder(superview());
}

bool TnTextBox::resignFirstResponder()
{
    if (m_isTextBoxDeleted)
        return true;
    setEditable(false);
    becomePlaced();
    setAccessibleDescription({});
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
    // A box that undo brings back can be edited, and left, once more. While the box counts as
    // deleted, leaving it would do nothing.
    if (window())
        m_isTextBoxDeleted = false;
}

void TnTextBox::deleteTextBox()
{
    if (m_deleteTextButton)
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
    if (!superview())
        return;
    m_isWritten = m_isWritten || !isBlank();
    if (!m_isWritten)
        return; // until the first letter the box stays where the canvas was clicked
    const platform::Size canvas = superview()->bounds().size();
    const platform::Size needed = layOutText(*document(), canvas.width);
    moveInto(frameInSight(frame(), needed, canvas));
    ensureCursorVisible(); // a box that became less high does not scroll by itself
}

void TnTextBox::moveInto(const Rect &frame)
{
    setFrame(frame);
    setNeedsDisplay(); // draw() also puts the delete button in its place
}

void TnTextBox::superviewDidResize(platform::Size former)
{
    const platform::Size canvas = superview()->bounds().size();
    if (!isEditable() || (canvas.width >= former.width && canvas.height >= former.height))
        return;
    if (m_isWritten)
        fitToText();
    else
        moveInto(frameInSight(frame(), frame().size(), canvas));
}

void TnTextBox::sayRefused(int count)
{
    sayAt(*this,
        count == 1 ? tr("One character did not fit into this text box.")
                   : tr("%L1 characters did not fit into this text box.").arg(count));
}

} // namespace penwick
