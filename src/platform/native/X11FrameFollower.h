// SPDX-License-Identifier: MIT
// Follows the frames that a window manager puts around windows.
// Some window managers tell a window that is dragged by its title bar nothing until it is let go.
// The frame, a window of the window manager's own, moves at once and tells so.
// Some make the frame larger than what is seen of it, so that its borders can be taken hold of from
// outside; the corner that is told is that of what is seen.
#pragma once

#include "platform/native/NativeDesktop.h"
#include "platform/native/X11Client.h"

#include <QAbstractNativeEventFilter>
#include <QRect>
#include <QSize>

#include <optional>
#include <vector>

namespace penwick::platform {

/// Listens on the application's own connection. In a host whose event loop calls no native event
/// filters it hears nothing; the windows are then followed by the toolkit's events alone.
class X11FrameFollower final : public QAbstractNativeEventFilter
{
public:
    /// Borrows `client`, which must live longer.
    explicit X11FrameFollower(const X11Client &client);
    ~X11FrameFollower() override;

    void follow(xcb_window_t window, NativeDesktop::FrameListener listener);
    void forget(xcb_window_t window);
    /// Where the content of `window` is, in device pixels of the desktop, as the server says;
    /// nothing if it has a frame, which tells by itself.
    [[nodiscard]] std::optional<QRect> unframedContent(xcb_window_t window) const;
    /// Writes the shape that the content of `window` keeps into the window's hints, and again
    /// whenever the toolkit writes them without it; an empty `content` takes it out. Only for a
    /// followed window.
    void keepContentRatio(xcb_window_t window, const QSize &content);

    bool nativeEventFilter(const QByteArray &eventType, void *message, qintptr *result) override;

private:
    struct Followed
    {
        xcb_window_t window;
        xcb_window_t frame; // XCB_NONE while there is none
        NativeDesktop::FrameListener listener;
        QSize contentRatio {}; // empty: any
        QPoint content {}; // in its parent, as it was told last
        QPoint inset {}; // from the frame's corner to that of what is seen of it
    };

    [[nodiscard]] Followed *find(xcb_window_t window);
    [[nodiscard]] const Followed *find(xcb_window_t window) const;
    void onBordersChanged(Followed &followed);
    void listenTo(const Followed &followed) const;
    void measure(Followed &followed) const;
    void tellCorner(const Followed &followed) const;
    void writeContentRatio(const Followed &followed) const;
    void onPropertyChanged(const xcb_property_notify_event_t &event);
    void onReparented(const xcb_reparent_notify_event_t &event);
    void onConfigured(const xcb_configure_notify_event_t &event);
    [[nodiscard]] bool isFocusOfAGrab(const xcb_focus_in_event_t &event);

    const X11Client &m_client;
    const xcb_atom_t m_extents; // the property with the borders that are seen around a window
    std::vector<Followed> m_followed;
};

} // namespace penwick::platform
