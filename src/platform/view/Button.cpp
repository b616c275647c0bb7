// SPDX-License-Identifier: MIT
#include "platform/view/Button.h"

#include "platform/view/PointerPress.h"

#include <utility>

namespace penwick::platform {

namespace {

constexpr double titleInset = 2.0; // points, from the left and right edges

bool isPress(const QEvent &event)
{
    const bool isDown = event.type() == QEvent::MouseButtonPress
        || event.type() == QEvent::MouseButtonDblClick || event.type() == QEvent::TabletPress;
    return isDown && static_cast<const QSinglePointEvent &>(event).button() == Qt::LeftButton;
}

} // namespace

Button::Button(QWidget *parent)
    : ViewOf(parent)
{
    connect(this, &QAbstractButton::clicked, this, &Button::press);
}

void Button::press()
{
    afterPointerIsReleased(*this, [this] {
        m_state = State::On;
        if (m_action)
            m_action(*this);
    });
}

void Button::setImage(const QIcon &image)
{
    m_image = image;
    setNeedsDisplay();
}

void Button::setAlternateImage(const QIcon &image)
{
    m_alternateImage = image;
    setNeedsDisplay();
}

void Button::setBackgroundColor(const QColor &color)
{
    m_backgroundColor = color;
    setNeedsDisplay();
}

void Button::setAttributedTitle(const AttributedString &title)
{
    m_attributedTitle = title;
    setText(title.string); // what accessibility reads out
    const bool isWhole = fittedTitle().isWhole;
    if (!isWhole && !m_ownToolTip)
        m_ownToolTip = toolTip();
    if (m_ownToolTip)
        setToolTip(isWhole ? *std::exchange(m_ownToolTip, std::nullopt) : title.string);
    setNeedsDisplay();
}

void Button::draw(const Rect &)
{
    Painter painter(*this);
    Layer *const ownLayer = layer();
    const double radius = ownLayer ? ownLayer->cornerRadius : 0.0;
    painter.setPen(Qt::NoPen);
    painter.setBrush(m_backgroundColor);
    painter.drawRoundedRect(QRectF(rect()), radius, radius);

    const QIcon &shown = isDown() && !m_alternateImage.isNull() ? m_alternateImage : m_image;
    if (!shown.isNull()) {
        const QSize size = shown.actualSize(rect().size());
        const QRect place(
            rect().center() - QPoint((size.width() - 1) / 2, (size.height() - 1) / 2), size);
        shown.paint(
            &painter, place, Qt::AlignCenter, isEnabled() ? QIcon::Normal : QIcon::Disabled);
    } else if (!m_attributedTitle.string.isEmpty()) {
        const FittedText title = fittedTitle();
        painter.setFont(title.font);
        painter.setPen(m_attributedTitle.foregroundColor);
        painter.drawText(
            rect(), static_cast<int>(m_attributedTitle.alignment | Qt::AlignVCenter), title.string);
    }
}

FittedText Button::fittedTitle() const
{
    return fittedText(
        m_attributedTitle.string, m_attributedTitle.font, frame().width - 2 * titleInset);
}

// The toolkit lets a disabled button swallow presses before any of its operations hears of them.
bool Button::event(QEvent *event)
{
    if (!isEnabled() && isPress(*event))
        pressIsComing();
    return ViewOf::event(event);
}

bool Button::hitButton(const QPoint &position) const
{
    return rect().contains(position);
}

QSize Button::sizeHint() const
{
    return { static_cast<int>(frame().width), static_cast<int>(frame().height) };
}

} // namespace penwick::platform
