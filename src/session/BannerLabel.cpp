// SPDX-License-Identifier: MIT
#include "session/BannerLabel.h"

#include "platform/view/OwnLook.h"

#include <QFontMetricsF>
#include <QPainterPath>

namespace penwick {

namespace {

constexpr QColor ink { 255, 255, 255 };
constexpr QColor outline { 41, 41, 41 };
constexpr double outlineWidth = 4.0; // points; half of it shows
constexpr double fontSize = 16; // points

} // namespace

BannerLabel::BannerLabel(QWidget *parent)
    : ViewOf(parent)
    , m_font(platform::ownFont(fontSize))
{
    m_font.setWeight(QFont::DemiBold);
    setFont(m_font);
}

void BannerLabel::setText(const QString &text)
{
    m_text = text;
    setAccessibleName(text);
    setNeedsDisplay();
}

double BannerLabel::widthOfText() const
{
    return QFontMetricsF(m_font).horizontalAdvance(m_text) + outlineWidth;
}

void BannerLabel::draw(const platform::Rect &)
{
    const QFontMetricsF metrics(m_font);
    const QString shown = metrics.elidedText(m_text, Qt::ElideRight, width() - outlineWidth);
    const double x = (width() - metrics.horizontalAdvance(shown)) / 2;
    const double baseline = (height() + metrics.ascent() - metrics.descent()) / 2;
    QPainterPath letters;
    letters.addText(x, baseline, m_font, shown);
    Painter painter(*this);
    painter.strokePath(
        letters, QPen(outline, outlineWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.fillPath(letters, ink);
}

} // namespace penwick
