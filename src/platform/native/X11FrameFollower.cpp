// SPDX-License-Identifier: MIT
#include "platform/native/X11FrameFollower.h"

#include "platform/native/X11Reply.h"

#include <QCoreApplication>

#include <algorithm>

namespace penwick::platform {

namespace {

constexpr std::uint8_t sentByAnotherClient = 0x80;

} // namespace

X11FrameFollower::X11FrameFollower(xcb_connection_t *connection, xcb_window_t root)
    : m_connection(connection)
    , m_root(root)
{
    QCoreApplication::instance()->installNativeEventFilter(this);
}

X11FrameFollower::~X11FrameFollower() = default;

void X11FrameFollower::follow(xcb_window_t window, NativeDesktop::FrameListener listener)
{
    if (Followed *const known = find(window))
        known->listener = std::move(listener);
    else
        m_followed.push_back({ window, XCB_NONE, std::move(listener) });
}

void X11FrameFollower::forget(xcb_window_t window)
{
    std::erase_if(m_followed, [window](const Followed &each) { return each.window == window; });
}

X11FrameFollower::Followed *X11FrameFollower::find(xcb_window_t window)
{
    const auto place = std::find_if(m_followed.begin(), m_followed.end(),
        [window](const Followed &each) { return each.window == window; });
    return place == m_followed.end() ? nullptr : &*place;
}

bool X11FrameFollower::nativeEventFilter(const QByteArray &eventType, void *message, qintptr *)
{
    if (eventType != QByteArrayLiteral("xcb_generic_event_t"))
        return false;
    const auto *const event = static_cast<const xcb_generic_event_t *>(message);
    switch (event->response_type & ~sentByAnotherClient) {
    case XCB_REPARENT_NOTIFY:
        onReparented(*static_cast<const xcb_reparent_notify_event_t *>(message));
        return false;
    case XCB_CONFIGURE_NOTIFY:
        onConfigured(*static_cast<const xcb_configure_notify_event_t *>(message));
        return false;
    case XCB_FOCUS_IN:
    case XCB_FOCUS_OUT:
        return isFocusOfAGrab(*static_cast<const xcb_focus_in_event_t *>(message));
    default:
        return false;
    }
}

// A window manager that drags a window grabs the keyboard, which looks as if another window had
// taken over until the user lets go.
bool X11FrameFollower::isFocusOfAGrab(const xcb_focus_in_event_t &event)
{
    return (event.mode == XCB_NOTIFY_MODE_GRAB || event.mode == XCB_NOTIFY_MODE_UNGRAB)
        && find(event.event);
}

void X11FrameFollower::onReparented(const xcb_reparent_notify_event_t &event)
{
    Followed *const followed = find(event.window);
    if (!followed)
        return;
    followed->frame = event.parent == m_root ? XCB_NONE : childOfRootAround(event.parent);
    if (followed->frame == XCB_NONE) {
        followed->listener(std::nullopt);
        return;
    }
    const std::uint32_t mask = XCB_EVENT_MASK_STRUCTURE_NOTIFY; // ours alone: masks are per client
    xcb_change_window_attributes(m_connection, followed->frame, XCB_CW_EVENT_MASK, &mask);
    // Where it went before we listened.
    const auto cookie = xcb_get_geometry(m_connection, followed->frame);
    const auto reply = owned(xcb_get_geometry_reply(m_connection, cookie, nullptr));
    if (reply)
        followed->listener(QPoint(reply->x, reply->y));
}

void X11FrameFollower::onConfigured(const xcb_configure_notify_event_t &event)
{
    const auto place = std::find_if(m_followed.begin(), m_followed.end(),
        [&event](const Followed &each) { return each.frame == event.window; });
    if (place != m_followed.end())
        place->listener(QPoint(event.x, event.y));
}

xcb_window_t X11FrameFollower::childOfRootAround(xcb_window_t window) const
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

} // namespace penwick::platform
