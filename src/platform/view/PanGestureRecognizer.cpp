// SPDX-License-Identifier: MIT
#include "platform/view/PanGestureRecognizer.h"

#include "platform/view/View.h"

#include <cmath>

namespace penwick::platform {

namespace {

// A click may move by less than this, because no hand is quite steady.
constexpr double slop = 3.0; // points

} // namespace

PanGestureRecognizer::PanGestureRecognizer(Action action)
    : m_action(std::move(action))
{ }

Point PanGestureRecognizer::locationIn(const View *view) const
{
    return view ? view->convertFrom(m_location, nullptr) : m_location;
}

void PanGestureRecognizer::pressed(Point location)
{
    m_isPressed = true;
    m_state = State::Possible;
    m_pressLocation = location;
}

void PanGestureRecognizer::dragged(Point location)
{
    if (!m_isPressed)
        return;
    if (m_state == State::Possible) {
        const Point way = location - m_pressLocation;
        if (std::hypot(way.x, way.y) < slop)
            return;
        // The drag begins at the press, so that what was taken hold of stays under the pointer.
        enter(State::Began, m_pressLocation);
    }
    enter(State::Changed, location);
}

void PanGestureRecognizer::released(Point location)
{
    if (!m_isPressed)
        return;
    m_isPressed = false;
    if (m_state != State::Possible)
        enter(State::Ended, location);
}

void PanGestureRecognizer::enter(State state, Point location)
{
    m_state = state;
    m_location = location;
    m_action(*this);
}

} // namespace penwick::platform
