// SPDX-License-Identifier: MIT
// How a window stands among others, in an X11 window manager's words.
#pragma once

#include "platform/native/WindowStanding.h"
#include "platform/native/X11Client.h"

#include <QAbstractNativeEventFilter>

#include <vector>

namespace penwick::platform {

/// Writes what window managers read when a window comes to the screen, and sees to it that they do
/// what was meant. Listens on the application's own connection, also to what X11FrameFollower has
/// asked to hear of frames. In a host whose event loop calls no native event filters it only
/// writes.
class X11Standing final : public QAbstractNativeEventFilter
{
public:
    /// Borrows `client`, which must live longer.
    explicit X11Standing(const X11Client &client);
    ~X11Standing() override;

    /// For a window that exists and is not on the screen.
    void prepare(xcb_window_t window, const WindowStanding &standing);
    void forget(xcb_window_t window);

    bool nativeEventFilter(const QByteArray &eventType, void *message, qintptr *result) override;

private:
    struct Prepared
    {
        xcb_window_t window;
        WindowStanding standing;
        bool awaitsDesktop; // the window manager has not said yet where it has put the window
        bool isElsewhere = false; // on a virtual desktop that is not shown
        xcb_window_t frame = XCB_NONE; // the outermost window around it, while it is a layer's
    };

    void onStacked(const xcb_configure_notify_event_t &event) const;
    void onReparented(const xcb_reparent_notify_event_t &event);
    [[nodiscard]] bool onPropertyChanged(const xcb_property_notify_event_t &event);
    [[nodiscard]] Prepared *find(xcb_window_t window);
    void raisePanels() const;
    void writeTypes(xcb_window_t window, const WindowStanding &standing) const;
    void refuseKeys(xcb_window_t window) const;
    void onDesktopTold(Prepared &prepared) const;
    [[nodiscard]] bool onStateTold(
        Prepared &prepared, const xcb_property_notify_event_t &event) const;
    void letToolkitLook(const xcb_property_notify_event_t &event) const;
    [[nodiscard]] std::uint32_t managedState(xcb_window_t window) const;
    [[nodiscard]] bool isSaidToBeHidden(xcb_window_t window) const;

    const X11Client &m_client;
    const xcb_atom_t m_desktop;
    const xcb_atom_t m_type;
    const xcb_atom_t m_iconState;
    const xcb_atom_t m_state;
    const xcb_atom_t m_hidden;
    std::vector<Prepared> m_prepared;
};

} // namespace penwick::platform
