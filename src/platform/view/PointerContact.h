// SPDX-License-Identifier: MIT
// One pointer at a time works on a view, and what it does is a click until it has gone far enough.
#pragma once

#include "platform/view/View.h"

#include <QPointer>
#include <QPointingDevice>

class QPointerEvent;
class QTabletEvent;

namespace penwick::platform {

/// The contact of a pointer with one view, from the press to the release.
///
/// The toolkit may tell the same contact of a pen twice, as the pen's own events and as a mouse's;
/// and a mouse may be pressed while a pen is down. Only what began the contact goes on with it.
class PointerContact
{
public:
    /// Whether there is one.
    [[nodiscard]] bool isOn() const { return m_isOn; }
    /// Whether `event` goes on with it: it comes the way that the press came.
    [[nodiscard]] bool isContinuedBy(const QPointerEvent &event) const;
    /// Whether a press may not begin one, because another pointer that is still there has.
    [[nodiscard]] bool excludes(const QPointerEvent &press) const;
    /// Whether `hover`, which holds no button, tells that it is over though no release was heard: a
    /// pen that is down does not hover.
    [[nodiscard]] bool isBeliedBy(const QPointerEvent &hover) const;

    /// A press at `location`, in the window, begins one, in the place of one that was not ended.
    void begin(const QPointerEvent &press, Point location, int clickCount);
    /// Ends it; answers whether there was one.
    bool end();

    [[nodiscard]] int clickCount() const { return m_clickCount; } ///< of the press
    /// Whether it is a drag now that it is at `location`: it has once been at least `distance`
    /// away from the press, along both axes together.
    [[nodiscard]] bool isDrag(Point location, double distance);

private:
    enum class Way
    {
        Mouse, // fingers too: the toolkit makes a mouse's events of theirs
        PenAsMouse,
        Pen
    };
    static Way wayOf(const QPointerEvent &event);

    bool m_isOn = false;
    bool m_isDrag = false;
    Way m_way = Way::Mouse;
    QPointer<const QPointingDevice> m_device;
    Point m_pressLocation;
    int m_clickCount = 0;
};

/// Which end of a pen `event` is of, in whichever way the toolkit tells it.
[[nodiscard]] PenEnd penEndOf(const QPointerEvent &event);
/// Whether a pen's press may be taken as it is. While a menu or a dialog is open it goes to the
/// toolkit, which makes a mouse's of it: only those close menus and stop at dialogs.
[[nodiscard]] bool mayTakePress(const QTabletEvent &event);

} // namespace penwick::platform
