// SPDX-License-Identifier: MIT
// What the component asks of the X server and its window manager, over the application's own
// connection.
#pragma once

#include <xcb/xcb.h>

#include <array>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <vector>

namespace penwick::platform {

/// Borrows the connection, which is the toolkit's.
class X11Client
{
public:
    explicit X11Client(xcb_connection_t *connection);

    [[nodiscard]] xcb_connection_t *connection() const { return m_connection; }
    [[nodiscard]] xcb_window_t root() const { return m_root; }

    [[nodiscard]] xcb_atom_t atom(std::string_view name) const;
    /// The 32-bit numbers of a property; none if it is not set, or of another kind.
    [[nodiscard]] std::vector<std::uint32_t> numbers(
        xcb_window_t window, xcb_atom_t property, xcb_atom_t type, std::uint32_t most) const;
    void setNumbers(xcb_window_t window, xcb_atom_t property, xcb_atom_t type,
        const std::vector<std::uint32_t> &values) const;
    /// Whether the window manager says that it knows `feature`.
    [[nodiscard]] bool managerSupports(xcb_atom_t feature) const;
    /// The window itself, or the outermost that a window manager has put around it; XCB_NONE if the
    /// window is gone.
    [[nodiscard]] xcb_window_t childOfRootAround(xcb_window_t window) const;
    /// Sends a request to the root, which is where a window manager listens.
    void askManager(xcb_window_t window, xcb_atom_t what, std::uint32_t value = 0) const;
    /// Sends an event of `window` to the program that has made it, which is this one.
    template <class Event>
    void sendToOwnProgram(xcb_window_t window, const Event &event) const
    {
        static_assert(sizeof(Event) <= 32);
        std::array<char, 32> bytes {}; // the server reads as many of each event
        std::memcpy(bytes.data(), &event, sizeof event);
        xcb_send_event(m_connection, 0, window, XCB_EVENT_MASK_NO_EVENT, bytes.data());
        xcb_flush(m_connection);
    }

private:
    xcb_connection_t *const m_connection;
    const xcb_window_t m_root;
    const xcb_atom_t m_supported;
};

} // namespace penwick::platform
