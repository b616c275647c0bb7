// SPDX-License-Identifier: MIT
#include "desktop/support/OtherProgram.h"

#include "desktop/support/Desktop.h"
#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <X11/Xlib.h>

#include <X11/Xatom.h>
#include <X11/Xutil.h>

namespace penwick::desktop {

OtherProgram::OtherProgram(Desktop &desktop, const QRect &area, const QColor &color, Kind kind)
    : m_desktop(desktop)
    , m_connection(std::make_unique<XConnection>(desktop.displayName()))
{
    Display *const display = m_connection->display();
    // The screen has 24 bits, eight for each of red, green and blue.
    m_window = XCreateSimpleWindow(display, m_connection->root(), area.x(), area.y(),
        static_cast<unsigned int>(area.width()), static_cast<unsigned int>(area.height()), 0, 0,
        color.rgb() & 0xffffffU);
    XStoreName(display, m_window, "Somebody else's");
    XSizeHints hints {};
    hints.flags = USPosition | USSize | PWinGravity;
    hints.win_gravity = StaticGravity; // the content where it was asked for, not the title bar
    XSetWMNormalHints(display, m_window, &hints);
    if (kind == Kind::Dock)
        say("_NET_WM_WINDOW_TYPE", "_NET_WM_WINDOW_TYPE_DOCK");
    if (kind == Kind::FullScreen)
        say("_NET_WM_STATE", "_NET_WM_STATE_FULLSCREEN");
    XSelectInput(display, m_window, ButtonPressMask);
    XMapWindow(display, m_window);
    const QPoint middle = area.center();
    require(
        [&] {
            m_connection->finish();
            return m_desktop.windows().isShown(m_window)
                && m_desktop.screen().pixel(middle) == color;
        },
        "another program's window to be shown");
}

OtherProgram::~OtherProgram() = default;

void OtherProgram::say(const char *property, const char *what)
{
    const Atom value = m_connection->atom(what);
    XChangeProperty(m_connection->display(), m_window, m_connection->atom(property), XA_ATOM, 32,
        PropModeReplace, reinterpret_cast<const unsigned char *>(&value), 1);
}

QRect OtherProgram::area() const
{
    return m_desktop.windows().clientArea(m_window);
}

int OtherProgram::presses()
{
    m_connection->finish();
    XEvent event {};
    while (XCheckTypedWindowEvent(m_connection->display(), m_window, ButtonPress, &event))
        ++m_presses;
    return m_presses;
}

void OtherProgram::turn(const QColor &color)
{
    XSetWindowBackground(m_connection->display(), m_window, color.rgb() & 0xffffffU);
    XClearWindow(m_connection->display(), m_window);
    m_connection->finish();
}

void OtherProgram::raise()
{
    XRaiseWindow(m_connection->display(), m_window);
    m_connection->finish();
}

} // namespace penwick::desktop
