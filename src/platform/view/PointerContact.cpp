// SPDX-License-Identifier: MIT
#include "platform/view/PointerContact.h"

#include <QApplication>
#include <QPointerEvent>
#include <QTabletEvent>

#include <cmath>
#include <utility>

namespace penwick::platform {

PointerContact::Way PointerContact::wayOf(const QPointerEvent &event)
{
    if (event.type() == QEvent::TabletPress || event.type() == QEvent::TabletMove
        || event.type() == QEvent::TabletRelease)
        return Way::Pen;
    return penEndOf(event) == PenEnd::None ? Way::Mouse : Way::PenAsMouse;
}

bool PointerContact::isContinuedBy(const QPointerEvent &event) const
{
    return m_isOn && wayOf(event) == m_way;
}

// A device that was unplugged in the middle of a contact must not exclude all others for ever.
bool PointerContact::excludes(const QPointerEvent &press) const
{
    return m_isOn && wayOf(press) != m_way && m_device;
}

bool PointerContact::isBeliedBy(const QPointerEvent &hover) const
{
    if (m_way == Way::Mouse)
        return m_isOn && wayOf(hover) == Way::Mouse;
    return m_isOn && penEndOf(hover) != PenEnd::None;
}

void PointerContact::begin(const QPointerEvent &press, Point location, int clickCount)
{
    m_isOn = true;
    m_isDrag = false;
    m_way = wayOf(press);
    m_device = press.pointingDevice();
    m_pressLocation = location;
    m_clickCount = clickCount;
}

bool PointerContact::end()
{
    return std::exchange(m_isOn, false);
}

bool PointerContact::isDrag(Point location, double distance)
{
    const Point way = location - m_pressLocation;
    m_isDrag = m_isDrag || std::abs(way.x) + std::abs(way.y) >= distance; // the toolkit's measure
    return m_isDrag;
}

PenEnd penEndOf(const QPointerEvent &event)
{
    switch (event.pointerType()) {
    case QPointingDevice::PointerType::Pen:
        return PenEnd::Tip;
    case QPointingDevice::PointerType::Eraser:
        return PenEnd::Eraser;
    default:
        return PenEnd::None;
    }
}

bool mayTakePress(const QTabletEvent &event)
{
    return event.button() == Qt::LeftButton && !QApplication::activePopupWidget()
        && !QApplication::activeModalWidget();
}

} // namespace penwick::platform
