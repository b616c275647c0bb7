// SPDX-License-Identifier: MIT
// X11, through Qt's own connection.
#include "platform/native/NativeDesktop.h"
#include "platform/native/X11FrameFollower.h"
#include "platform/native/X11Reply.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QThread>
#include <QWindow>

#include <xcb/xcb.h>

#include <algorithm>
#include <cstring>
#include <string_view>
#include <vector>

namespace penwick::platform {

namespace {

// Window managers usually answer within a millisecond. One that does not is given up after this.
constexpr int longestWait = 50; // ms

constexpr std::uint32_t allDesktops = 0xFFFFFFFF;
constexpr std::uint32_t fromApplication = 1; // the request is not a pager's

class NativeDesktopX11 final : public NativeDesktop
{
public:
    explicit NativeDesktopX11(xcb_connection_t *connection)
        : m_connection(connection)
        , m_root(xcb_setup_roots_iterator(xcb_get_setup(connection)).data->root)
        , m_managerCheck(atom("_NET_SUPPORTING_WM_CHECK"))
        , m_supported(atom("_NET_SUPPORTED"))
        , m_frameExtents(atom("_NET_FRAME_EXTENTS"))
        , m_requestFrameExtents(atom("_NET_REQUEST_FRAME_EXTENTS"))
        , m_desktop(atom("_NET_WM_DESKTOP"))
        , m_compositor(atom("_NET_WM_CM_S0"))
        , m_frames(connection, m_root, m_frameExtents)
    { }

    std::optional<QMargins> frameMarginsBeforeShow(QWindow &window) override
    {
        if (hasManagerEnded())
            return QMargins();
        if (!windowManagerSupports(m_requestFrameExtents))
            return std::nullopt;
        const auto id = static_cast<xcb_window_t>(window.winId());
        // Otherwise what is left from an earlier showing would be taken for the answer.
        xcb_delete_property(m_connection, id, m_frameExtents);
        askToRoot(id, m_requestFrameExtents);
        QElapsedTimer clock;
        clock.start();
        while (clock.elapsed() < longestWait) {
            const auto extents = numbers(id, m_frameExtents, XCB_ATOM_CARDINAL, 4);
            if (extents.size() == 4) {
                return QMargins(static_cast<int>(extents[0]), static_cast<int>(extents[2]),
                    static_cast<int>(extents[1]), static_cast<int>(extents[3]));
            }
            QThread::usleep(200);
        }
        return std::nullopt;
    }

    void followFrame(QWindow &window, FrameListener listener) override
    {
        m_frames.follow(static_cast<xcb_window_t>(window.winId()), std::move(listener));
    }

    [[nodiscard]] bool isCompositing() const override
    {
        const auto cookie = xcb_get_selection_owner(m_connection, m_compositor);
        const auto reply = owned(xcb_get_selection_owner_reply(m_connection, cookie, nullptr));
        return reply && reply->owner != XCB_NONE;
    }

    [[nodiscard]] bool isPointerHeld() const override
    {
        constexpr std::uint16_t buttons
            = XCB_BUTTON_MASK_1 | XCB_BUTTON_MASK_2 | XCB_BUTTON_MASK_3; // the others are wheels
        const auto cookie = xcb_query_pointer(m_connection, m_root);
        const auto reply = owned(xcb_query_pointer_reply(m_connection, cookie, nullptr));
        return reply && (reply->mask & buttons) != 0;
    }

    void keepContentRatio(QWindow &window, const QSize &content) override
    {
        m_frames.keepContentRatio(static_cast<xcb_window_t>(window.winId()), content);
    }

    void applyAttributes(QWindow &window, const WindowAttributes &attributes) override
    {
        // Nothing on this desktop keeps a window out of a capture; the host has to leave it out.
        if (attributes.collectionBehavior.testFlag(CollectionBehavior::canJoinAllSpaces))
            askToRoot(static_cast<xcb_window_t>(window.winId()), m_desktop, allDesktops);
    }

    void forgetFrame(WId window) override { m_frames.forget(static_cast<xcb_window_t>(window)); }

private:
    [[nodiscard]] xcb_atom_t atom(std::string_view name) const
    {
        const auto cookie = xcb_intern_atom(
            m_connection, 0, static_cast<std::uint16_t>(name.size()), name.data());
        const auto reply = owned(xcb_intern_atom_reply(m_connection, cookie, nullptr));
        return reply ? reply->atom : static_cast<xcb_atom_t>(XCB_ATOM_NONE);
    }

    [[nodiscard]] std::vector<std::uint32_t> numbers(
        xcb_window_t window, xcb_atom_t property, xcb_atom_t type, std::uint32_t most) const
    {
        const auto cookie = xcb_get_property(m_connection, 0, window, property, type, 0, most);
        const auto reply = owned(xcb_get_property_reply(m_connection, cookie, nullptr));
        if (!reply || reply->format != 32)
            return {};
        std::vector<std::uint32_t> values(reply->value_len);
        std::memcpy(values.data(), xcb_get_property_value(reply.get()), values.size() * 4);
        return values;
    }

    // Whether there was a window manager that has ended. What it wrote on the root window outlives
    // it; the window of its own that it named there does not. If nothing was written, nothing is
    // known, and the answer is no.
    [[nodiscard]] bool hasManagerEnded() const
    {
        const auto announced = numbers(m_root, m_managerCheck, XCB_ATOM_WINDOW, 1);
        return !announced.empty()
            && numbers(announced.front(), m_managerCheck, XCB_ATOM_WINDOW, 1) != announced;
    }

    [[nodiscard]] bool windowManagerSupports(xcb_atom_t feature) const
    {
        constexpr std::uint32_t moreThanAnyManagerHas = 1024;
        const auto features = numbers(m_root, m_supported, XCB_ATOM_ATOM, moreThanAnyManagerHas);
        return std::find(features.begin(), features.end(), feature) != features.end();
    }

    // Sent to the root, which is where a window manager listens.
    void askToRoot(xcb_window_t window, xcb_atom_t what, std::uint32_t value = 0) const
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

    xcb_connection_t *const m_connection;
    const xcb_window_t m_root;
    const xcb_atom_t m_managerCheck;
    const xcb_atom_t m_supported;
    const xcb_atom_t m_frameExtents;
    const xcb_atom_t m_requestFrameExtents;
    const xcb_atom_t m_desktop;
    const xcb_atom_t m_compositor;
    X11FrameFollower m_frames;
};

} // namespace

std::unique_ptr<NativeDesktop> makeNativeDesktop()
{
    // Qt's offscreen platform offers this interface too, without a connection, or with one that
    // none of our windows is on.
    if (QGuiApplication::platformName() != QStringLiteral("xcb"))
        return nullptr;
    auto *const x11 = qGuiApp->nativeInterface<QNativeInterface::QX11Application>();
    if (!x11 || !x11->connection())
        return nullptr;
    return std::make_unique<NativeDesktopX11>(x11->connection());
}

} // namespace penwick::platform
