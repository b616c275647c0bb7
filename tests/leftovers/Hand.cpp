// SPDX-License-Identifier: MIT
#include "leftovers/Hand.h"

#include <QCoreApplication>
#include <QMouseEvent>

namespace penwick::test {

void Hand::press(QWidget &widget, QPointF place)
{
    m_pressed = &widget;
    m_place = widget.mapToGlobal(place);
    send(QEvent::MouseButtonPress);
}

void Hand::glide(QPointF way)
{
    constexpr int steps = 10;
    for (int step = 0; step < steps; ++step) {
        m_place += way / steps;
        send(QEvent::MouseMove);
    }
}

void Hand::release()
{
    send(QEvent::MouseButtonRelease);
    m_pressed = nullptr;
}

void Hand::click(QWidget &widget, QPointF place)
{
    press(widget, place);
    release();
}

void Hand::send(QEvent::Type type)
{
    if (!m_pressed)
        return;
    QMouseEvent event(type, m_pressed->mapFromGlobal(m_place), m_place,
        type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton,
        type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_pressed, &event);
}

} // namespace penwick::test
