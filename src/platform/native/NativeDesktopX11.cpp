// SPDX-License-Identifier: MIT
// X11, through Qt's own connection.
#include "platform/native/NativeDesktop.h"
#include "platform/native/X11Client.h"
#include "platform/native/X11FrameFollower.h"
#include "platform/native/X11Reply.h"
#include "platform/native/X11Standing.h"

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QThread>
#include <QWindow>

#include <xcb/xcb.h>

namespace penwick::platform {

namespace {

// Window managers usually answer within a millisecond. One that does not is given up after this.
constexpr int longestWait = 50; // ms

class NativeDesktopX11 final : public NativeDesktop
{
public:
    explicit NativeDesktopX11(xcb_connection_t *connection)
        : m_client(connection)
        , m_managerCheck(m_client.atom("_NET_SUPPORTING_WM_CHECK"))
        , m_frameExtents(m_client.atom("_NET_FRAME_EXTENTS"))
        , m_requestFrameExtents(m_client.atom("_NET_REQUEST_FRAME_EXTENTS"))
        , m_compositor(m_client.atom("_NET_WM_CM_S0"))
        , m_frames(m_client)
        , m_standing(m_client)
    { }

    std::optional<QMargins> frameMarginsBeforeShow(QWindow &window) override
    {
        if (hasManagerEnded())
            return QMargins();
        if (!m_client.managerSupports(m_requestFrameExtents))
            return std::nullopt;
        const auto id = static_cast<xcb_window_t>(window.winId());
        // Otherwise what is left from an earlier showing would be taken for the answer.
        xcb_delete_property(m_client.connection(), id, m_frameExtents);
        m_client.askManager(id, m_requestFrameExtents);
        QElapsedTimer clock;
        clock.start();
        while (clock.elapsed() < longestWait) {
            const auto extents = m_client.numbers(id, m_frameExtents, XCB_ATOM_CARDINAL, 4);
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

    [[nodiscard]] std::optional<QRect> contentOnScreen(QWindow &window) const override
    {
        return m_frames.unframedContent(static_cast<xcb_window_t>(window.winId()));
    }

    [[nodiscard]] bool isCompositing() const override
    {
        const auto cookie = xcb_get_selection_owner(m_client.connection(), m_compositor);
        const auto reply
            = owned(xcb_get_selection_owner_reply(m_client.connection(), cookie, nullptr));
        return reply && reply->owner != XCB_NONE;
    }

    [[nodiscard]] bool isPointerHeld() const override
    {
        constexpr std::uint16_t buttons
            = XCB_BUTTON_MASK_1 | XCB_BUTTON_MASK_2 | XCB_BUTTON_MASK_3; // the others are wheels
        const auto cookie = xcb_query_pointer(m_client.connection(), m_client.root());
        const auto reply = owned(xcb_query_pointer_reply(m_client.connection(), cookie, nullptr));
        return reply && (reply->mask & buttons) != 0;
    }

    void keepContentRatio(QWindow &window, const QSize &content) override
    {
        m_frames.keepContentRatio(static_cast<xcb_window_t>(window.winId()), content);
    }

    // Mutter takes a window as large as the screen for maximised, and no longer keeps it above
    // others, unless this is its only size.
    void keepContentSize(QWindow &window, const QSize &content) override
    {
        constexpr QSize largest { 0xFFFFFF, 0xFFFFFF }; // which the toolkit takes for no limit
        window.setMinimumSize(content.isEmpty() ? QSize(0, 0) : content);
        window.setMaximumSize(content.isEmpty() ? largest : content);
    }

    void prepareToShow(QWindow &window, const WindowStanding &standing) override
    {
        m_standing.prepare(static_cast<xcb_window_t>(window.winId()), standing);
    }

    void forget(WId window) override
    {
        m_frames.forget(static_cast<xcb_window_t>(window));
        m_standing.forget(static_cast<xcb_window_t>(window));
    }

private:
    // Whether there was a window manager that has ended. What it wrote on the root window outlives
    // it; the window of its own that it named there does not. If nothing was written, nothing is
    // known, and the answer is no.
    [[nodiscard]] bool hasManagerEnded() const
    {
        const auto announced
            = m_client.numbers(m_client.root(), m_managerCheck, XCB_ATOM_WINDOW, 1);
        return !announced.empty()
            && m_client.numbers(announced.front(), m_managerCheck, XCB_ATOM_WINDOW, 1) != announced;
    }

    const X11Client m_client;
    const xcb_atom_t m_managerCheck;
    const xcb_atom_t m_frameExtents;
    const xcb_atom_t m_requestFrameExtents;
    const xcb_atom_t m_compositor;
    X11FrameFollower m_frames;
    X11Standing m_standing;
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
