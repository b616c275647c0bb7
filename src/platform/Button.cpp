// SPDX-License-Identifier: MIT
#include "platform/Button.h"

#include "platform/Bundle.h"
#include "platform/PointerPress.h"

namespace penwick::platform {

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

void Button::loadImages(const Bundle &bundle)
{
    if (!m_imageName.isEmpty())
        setImage(bundle.imageForResource(m_imageName));
    if (!m_alternateImageName.isEmpty())
        setAlternateImage(bundle.imageForResource(m_alternateImageName));
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
        painter.setFont(m_attributedTitle.font);
        painter.setPen(m_attributedTitle.foregroundColor);
        painter.drawText(rect(), static_cast<int>(m_attributedTitle.alignment | Qt::AlignVCenter),
            m_attributedTitle.string);
    }
}

QSize Button::sizeHint() const
{
    return { static_cast<int>(frame().width), static_cast<int>(frame().height) };
}

} // namespace penwick::platform
