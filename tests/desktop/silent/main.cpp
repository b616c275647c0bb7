// SPDX-License-Identifier: MIT
// A window manager that puts each window where it wants, grants nothing that is asked for later,
// and says nothing of either.
#include <X11/Xlib.h>

#include <X11/Xatom.h>

#include <cstdio>
#include <initializer_list>

namespace {

Atom atom(Display *display, const char *name)
{
    return XInternAtom(display, name, False);
}

void announce(Display *display)
{
    const Window root = DefaultRootWindow(display);
    const Window own = XCreateSimpleWindow(display, root, -1, -1, 1, 1, 0, 0, 0);
    const Atom supported = atom(display, "_NET_WM_STATE_ABOVE");
    XChangeProperty(display, root, atom(display, "_NET_SUPPORTED"), XA_ATOM, 32, PropModeReplace,
        reinterpret_cast<const unsigned char *>(&supported), 1);
    for (const Window window : { own, root }) {
        XChangeProperty(display, window, atom(display, "_NET_SUPPORTING_WM_CHECK"), XA_WINDOW, 32,
            PropModeReplace, reinterpret_cast<const unsigned char *>(&own), 1);
    }
}

void addToClients(Display *display, Window window)
{
    XChangeProperty(display, DefaultRootWindow(display), atom(display, "_NET_CLIENT_LIST"),
        XA_WINDOW, 32, PropModeAppend, reinterpret_cast<const unsigned char *>(&window), 1);
}

int ignore(Display *, XErrorEvent *)
{
    return 0; // a window that is gone already
}

} // namespace

int main()
{
    Display *const display = XOpenDisplay(nullptr);
    if (!display) {
        std::fputs("no display\n", stderr);
        return 1;
    }
    XSetErrorHandler(ignore);
    XSelectInput(
        display, DefaultRootWindow(display), SubstructureRedirectMask | SubstructureNotifyMask);
    announce(display);
    int windows = 0;
    for (;;) {
        XEvent event {};
        XNextEvent(display, &event);
        if (event.type == MapRequest) {
            const Window window = event.xmaprequest.window;
            ++windows;
            XMoveResizeWindow(display, window, 30 * windows, 20 * windows, 400 / windows, 300);
            addToClients(display, window);
            XMapWindow(display, window);
        }
    }
}
