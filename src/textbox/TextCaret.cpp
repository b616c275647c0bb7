// SPDX-License-Identifier: MIT
#include "textbox/TextCaret.h"

#include <QApplication>
#include <QPainter>
#include <QTextEdit>
#include <QTimerEvent>

#include <algorithm>

namespace penwick {

namespace {

constexpr double distanceFromEdge = 3.0; // points; where a box has its border

} // namespace

TextCaret::TextCaret(QTextEdit &editor)
    : m_editor(editor)
{ }

void TextCaret::show()
{
    m_isShown = true;
    restart();
}

void TextCaret::hide()
{
    m_isShown = false;
    m_blink.stop();
    update();
}

void TextCaret::restart()
{
    if (!m_isShown)
        return;
    m_isSolid = true;
    const int period = QApplication::cursorFlashTime(); // 0: the user wants it steady
    if (period > 0)
        m_blink.start(period / 2, this);
    else
        m_blink.stop();
    update();
}

void TextCaret::paint(QPainter &painter) const
{
    if (!m_isShown || !m_isSolid)
        return;
    QRectF place = m_editor.cursorRect();
    place.setWidth(caretWidth);
    // A box in which nothing has been written yet may be less high than a line of its font.
    const double height = m_editor.viewport()->height();
    place.setBottom(std::min(place.bottom(), height - distanceFromEdge));
    painter.fillRect(place, m_color);
}

void TextCaret::timerEvent(QTimerEvent *event)
{
    if (event->timerId() != m_blink.timerId())
        return;
    m_isSolid = !m_isSolid;
    update();
}

void TextCaret::update()
{
    m_editor.viewport()->update();
}

} // namespace penwick
