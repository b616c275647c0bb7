// SPDX-License-Identifier: MIT
// A hand on the pointer, without a screen: events are delivered to the widget that was pressed.
#pragma once

#include <QEvent>
#include <QPoint>
#include <QPointer>
#include <QWidget>

namespace penwick::test {

/// Presses a widget and goes on with that press. The widget may go in the middle of it; what the
/// hand does then reaches nobody.
class Hand final
{
public:
    /// Presses at `place` in `widget`, in its own points from its top left corner.
    void press(QWidget &widget, QPointF place);
    /// Goes from where it is so much further right and down, in small steps.
    void glide(QPointF way);
    void release();
    void click(QWidget &widget, QPointF place);

private:
    void send(QEvent::Type type);

    QPointer<QWidget> m_pressed;
    QPointF m_place; // on the screen
};

} // namespace penwick::test
