// SPDX-License-Identifier: MIT
#include "session/BannerLabel.h"

#include <QFontMetricsF>
#include <QPainterPath>

namespace penwick {

namespace {

constexpr QColor ink { 255, 255, 255 };
constexpr QColor outline { 41, 41, 41 };
constexpr double outlineWidth = 4.0; // points; half of it shows
constexpr int fontSize = 16; // points

} // namespace

BannerLabel::BannerLabel(QWidget *parent)
    : ViewOf(parent)
{
    QFont ownFont = font();
    ownFont.setPixelSize(fontSize);
    ownFont.setWeight(QFont::DemiBold);
    setFont(ownFont);
}

void BannerLabel::setText(const QString &text)
{
    m_text = text;
    setAccessibleName(text);
    setNeedsDisplay();
}

void BannerLabel::draw(const platform::Rect &)
{
    const QFontMetricsF metrics(font());
    const double x = (width() - metrics.horizontalAdvance(m_text)) / 2;
    const double baseline = (height() + metrics.ascent() - metrics.descent()) / 2;
    QPainterPath letters;
    letters.addText(x, baseline, font(), m_text);
    Painter painter(*this);
    painter.strokePath(
        letters, QPen(outline, outlineWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.fillPath(letters, ink);
}

} // namespace penwick
