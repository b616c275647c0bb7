// SPDX-License-Identifier: MIT
#include "platform/native/X11Client.h"

#include "platform/native/X11Reply.h"

#include <algorithm>

namespace penwick::platform {

namespace {

constexpr std::uint32_t fromApplication = 1; // the request is not a pager's

} // namespace

X11Client::X11Client(xcb_connection_t *connection)
    : m_connection(connection)
    , m_root(xcb_setup_roots_iterator(xcb_get_setup(connection)).data->root)
    , m_supported(atom("_NET_SUPPORTED"))
{ }

xcb_atom_t X11Client::atom(std::string_view name) const
{
    const auto cookie
        = xcb_intern_atom(m_connection, 0, static_cast<std::uint16_t>(name.size()), name.data());
    const auto reply = owned(xcb_intern_atom_reply(m_connection, cookie, nullptr));
    return reply ? reply->atom : static_cast<xcb_atom_t>(XCB_ATOM_NONE);
}

std::vector<std::uint32_t> X11Client::numbers(
    xcb_window_t window, xcb_atom_t property, xcb_atom_t type, std::uint32_t most) const
{
    const auto cookie = xcb_get_property(m_connection, 0, window, property, type, 0, most);
    const auto reply = owned(xcb_get_property_reply(m_connection, cookie, nullptr));
    if (!reply || reply->format != 32)
        return {};
    const auto *const first
        = static_cast<const std::uint32_t *>(xcb_get_property_value(reply.get()));
    return { first, first + reply->value_len };
}

void X11Client::setNumbers(xcb_window_t window, xcb_atom_t property, xcb_atom_t type,
    const std::vector<std::uint32_t> &values) const
{
    xcb_change_property(m_connection, XCB_PROP_MODE_REPLACE, window, property, type, 32,
        static_cast<std::uint32_t>(values.size()), values.data());
}

bool X11Client::managerSupports(xcb_atom_t feature) const
{
    constexpr std::uint32_t moreThanAnyManagerHas = 1024;
    const auto features = numbers(m_root, m_supported, XCB_ATOM_ATOM, moreThanAnyManagerHas);
    return std::ranges::find(features, feature) != features.end();
}

xcb_window_t X11Client::childOfRootAround(xcb_window_t window) const
{
    for (;;) {
        const auto cookie = xcb_query_tree(m_connection, window);
        const auto reply = owned(xcb_query_tree_reply(m_connection, cookie, nullptr));
        if (!reply || reply->parent == XCB_NONE)
            return XCB_NONE;
        if (reply->parent == m_root)
            return window;
        window = reply->parent;
    }
}

void X11Client::askManager(xcb_window_t window, xcb_atom_t what, std::uint32_t value) const
{
    xcb_client_message_event_t message {};
    message.response_type = XCB_CLIENT_MESSAGE;
    message.format = 32;
    message.window = window;
    message.type = what;
    message.data.data32[0] = value;
    message.data.data32[1] = fromApplication;
    xcb_send_event(m_connection, 0, m_root,
        XCB_EVENT_MASK_SUBSTRUCTURE_NOTIFY | XCB_EVENT_MASK_SUBSTRUCTURE_REDIRECT,
        reinterpret_cast<const char *>(&message));
    xcb_flush(m_connection);
}

} // namespace penwick::platform
