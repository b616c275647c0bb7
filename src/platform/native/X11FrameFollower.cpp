// SPDX-License-Identifier: MIT
#include "platform/native/X11FrameFollower.h"

#include "platform/native/X11Reply.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>
#include <cstring>
#include <utility>

namespace penwick::platform {

namespace {

constexpr std::uint8_t sentByAnotherClient = 0x80;

// The size hints of a window: 18 numbers. If the first has the flag, those from the two places on
// are the least and the most width and height of its shape.
constexpr std::uint32_t sizeHintsLength = 18;
constexpr std::uint32_t hasAspect = 1U << 7;
constexpr std::size_t leastAspect = 11;
constexpr std::size_t mostAspect = 13;

} // namespace

X11FrameFollower::X11FrameFollower(const X11Client &client)
    : m_client(client)
    , m_extents(client.atom("_NET_FRAME_EXTENTS"))
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

const X11FrameFollower::Followed *X11FrameFollower::find(xcb_window_t window) const
{
    const auto place = std::ranges::find(m_followed, window, &Followed::window);
    return place == m_followed.end() ? nullptr : &*place;
}

X11FrameFollower::Followed *X11FrameFollower::find(xcb_window_t window)
{
    return const_cast<Followed *>(std::as_const(*this).find(window));
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
    case XCB_PROPERTY_NOTIFY:
        onPropertyChanged(*static_cast<const xcb_property_notify_event_t *>(message));
        return false;
    case XCB_FOCUS_IN:
    case XCB_FOCUS_OUT:
        return isFocusOfAGrab(*static_cast<const xcb_focus_in_event_t *>(message));
    default:
        return false;
    }
}

// A window manager that drags a window grabs the keyboard. The toolkit would take that for another
// window becoming active, until the user lets go.
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
    followed->frame
        = event.parent == m_client.root() ? XCB_NONE : m_client.childOfRootAround(event.parent);
    if (followed->frame == XCB_NONE) {
        followed->listener(std::nullopt);
        return;
    }
    listenTo(*followed);
    measure(*followed);
    tellCorner(*followed); // which may have changed before this connection listened
}

void X11FrameFollower::listenTo(const Followed &followed) const
{
    const std::uint32_t mask = XCB_EVENT_MASK_STRUCTURE_NOTIFY; // each client has its own
    xcb_change_window_attributes(m_client.connection(), followed.frame, XCB_CW_EVENT_MASK, &mask);
}

// The content lies as far inside what is seen as its borders are wide; whatever lies outside of
// them is not seen. A frame that tells no borders is seen whole. So is one in which there is no
// room for them yet: KWin frames a window in one that lies in the frame, tells the borders, and
// then moves that, of which the window is told nothing.
void X11FrameFollower::measure(Followed &followed) const
{
    const auto place
        = xcb_translate_coordinates(m_client.connection(), followed.window, followed.frame, 0, 0);
    // left, right, top, bottom
    const auto borders = m_client.numbers(followed.window, m_extents, XCB_ATOM_CARDINAL, 4);
    const auto content
        = owned(xcb_translate_coordinates_reply(m_client.connection(), place, nullptr));
    followed.inset = QPoint();
    if (borders.size() != 4 || !content)
        return;
    followed.inset = QPoint(std::max(0, content->dst_x - static_cast<int>(borders[0])),
        std::max(0, content->dst_y - static_cast<int>(borders[2])));
}

void X11FrameFollower::tellCorner(const Followed &followed) const
{
    const auto cookie = xcb_get_geometry(m_client.connection(), followed.frame);
    const auto reply = owned(xcb_get_geometry_reply(m_client.connection(), cookie, nullptr));
    if (reply)
        followed.listener(QPoint(reply->x, reply->y) + followed.inset);
}

std::optional<QRect> X11FrameFollower::unframedContent(xcb_window_t window) const
{
    const Followed *const followed = find(window);
    if (!followed || followed->frame != XCB_NONE)
        return std::nullopt;
    const auto sizeAsked = xcb_get_geometry(m_client.connection(), window);
    const auto placeAsked
        = xcb_translate_coordinates(m_client.connection(), window, m_client.root(), 0, 0);
    const auto size = owned(xcb_get_geometry_reply(m_client.connection(), sizeAsked, nullptr));
    const auto place
        = owned(xcb_translate_coordinates_reply(m_client.connection(), placeAsked, nullptr));
    if (!size || !place)
        return std::nullopt;
    return QRect(place->dst_x, place->dst_y, size->width, size->height);
}

void X11FrameFollower::onConfigured(const xcb_configure_notify_event_t &event)
{
    const auto frame = std::find_if(m_followed.begin(), m_followed.end(),
        [&event](const Followed &each) { return each.frame == event.window; });
    if (frame != m_followed.end())
        frame->listener(QPoint(event.x, event.y) + frame->inset);
    Followed *const content = find(event.window);
    const bool isInParent = (event.response_type & sentByAnotherClient) == 0;
    if (content && content->frame != XCB_NONE && isInParent
        && std::exchange(content->content, QPoint(event.x, event.y)) != content->content)
        onBordersChanged(*content);
}

void X11FrameFollower::onBordersChanged(Followed &followed)
{
    const QPoint before = followed.inset;
    measure(followed);
    if (followed.inset != before)
        tellCorner(followed);
}

void X11FrameFollower::keepContentRatio(xcb_window_t window, const QSize &content)
{
    Followed *const followed = find(window);
    if (!followed || followed->contentRatio == content)
        return;
    followed->contentRatio = content;
    writeContentRatio(*followed);
}

// The toolkit rewrites the hints without the ratio when it shows a window or changes its limits. A
// window manager may tell its borders only after it has put the window into them.
void X11FrameFollower::onPropertyChanged(const xcb_property_notify_event_t &event)
{
    Followed *const followed = find(event.window);
    if (!followed)
        return;
    if (event.atom == XCB_ATOM_WM_NORMAL_HINTS && !followed->contentRatio.isEmpty())
        writeContentRatio(*followed);
    else if (event.atom == m_extents && followed->frame != XCB_NONE)
        onBordersChanged(*followed);
}

void X11FrameFollower::writeContentRatio(const Followed &followed) const
{
    const auto cookie = xcb_get_property(m_client.connection(), 0, followed.window,
        XCB_ATOM_WM_NORMAL_HINTS, XCB_ATOM_WM_SIZE_HINTS, 0, sizeHintsLength);
    const auto reply = owned(xcb_get_property_reply(m_client.connection(), cookie, nullptr));
    if (!reply)
        return;
    std::array<std::uint32_t, sizeHintsLength> hints {};
    std::memcpy(hints.data(), xcb_get_property_value(reply.get()),
        std::min(hints.size() * 4,
            static_cast<std::size_t>(xcb_get_property_value_length(reply.get()))));
    std::array<std::uint32_t, sizeHintsLength> wanted = hints;
    if (followed.contentRatio.isEmpty()) {
        wanted[0] &= ~hasAspect;
    } else {
        wanted[0] |= hasAspect;
        for (const std::size_t place : { leastAspect, mostAspect }) {
            wanted[place] = static_cast<std::uint32_t>(followed.contentRatio.width());
            wanted[place + 1] = static_cast<std::uint32_t>(followed.contentRatio.height());
        }
    }
    if (wanted == hints) // the event told of our own change
        return;
    xcb_change_property(m_client.connection(), XCB_PROP_MODE_REPLACE, followed.window,
        XCB_ATOM_WM_NORMAL_HINTS, XCB_ATOM_WM_SIZE_HINTS, 32, sizeHintsLength, wanted.data());
    xcb_flush(m_client.connection());
}

} // namespace penwick::platform
