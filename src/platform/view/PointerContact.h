// SPDX-License-Identifier: MIT
// One pointer at a time works on a view, and its press is a click until it has moved far enough.
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
/// and a mouse may be pressed while a pen is down. Only events of the kind that began the contact
/// continue it.
class PointerContact
{
public:
    /// Whether there is a contact.
    [[nodiscard]] bool isOn() const { return m_isOn; }
    /// Whether `event` continues the contact: it is told in the same way as the press was.
    [[nodiscard]] bool isContinuedBy(const QPointerEvent &event) const;
    /// Whether `press` must not begin a contact, because another pointer, which is still there, has
    /// one.
    [[nodiscard]] bool excludes(const QPointerEvent &press) const;
    /// Whether `hover`, a move without a button, shows that the contact is over although no release
    /// was heard: a pointer that is down does not hover.
    [[nodiscard]] bool isBeliedBy(const QPointerEvent &hover) const;

    /// Begins a contact with a press at `location`, in the window. An earlier contact that was not
    /// ended is forgotten.
    void begin(const QPointerEvent &press, Point location, int clickCount);
    /// Ends the contact; returns whether there was one.
    bool end();

    [[nodiscard]] int clickCount() const { return m_clickCount; } ///< of the press
    /// Whether the contact is a drag, now that its pointer is at `location`: the pointer has once
    /// been at least `distance` points away from the press, both axes added up.
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

/// Which end of a pen `event` is of, whether the toolkit tells it as a pen's or as a mouse's.
[[nodiscard]] PenEnd penEndOf(const QPointerEvent &event);
/// Whether a view may take a pen's press itself. While a menu or a dialog is open the press is left
/// to the toolkit, which turns it into a mouse's: only a mouse's press closes menus and is held
/// back by dialogs.
[[nodiscard]] bool mayTakePress(const QTabletEvent &event);

} // namespace penwick::platform
