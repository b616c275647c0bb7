// SPDX-License-Identifier: MIT
#include "desktop/support/XConnection.h"

#include "desktop/support/WaitUntil.h"

#include <QRect>

#include <X11/Xlib.h>

#include <X11/extensions/Xrandr.h>

#include <memory>
#include <stdexcept>

namespace penwick::desktop {

XConnection::XConnection(const std::string &displayName)
    : m_display(XOpenDisplay(displayName.c_str()))
{
    if (!m_display)
        throw std::runtime_error("the display " + displayName + " does not answer");
    XSetErrorHandler([](Display *, XErrorEvent *) { return 0; });
}

XConnection::~XConnection()
{
    XCloseDisplay(m_display);
}

unsigned long XConnection::root() const
{
    return DefaultRootWindow(m_display);
}

unsigned long XConnection::atom(const char *name) const
{
    return XInternAtom(m_display, name, False);
}

bool XConnection::hasSelectionOwner(const char *name) const
{
    return XGetSelectionOwner(m_display, atom(name)) != None;
}

void XConnection::setMonitors(const std::vector<QRect> &monitors) const
{
    const std::unique_ptr<XRRScreenResources, decltype(&XRRFreeScreenResources)> resources(
        XRRGetScreenResources(m_display, root()), &XRRFreeScreenResources);
    if (!resources || resources->noutput == 0)
        throw std::runtime_error("the X server has no monitor");
    for (const QRect &area : monitors) {
        const std::string name = "monitor" + std::to_string(&area - monitors.data());
        const bool isFirst = &area == &monitors.front();
        XRRMonitorInfo monitor {};
        monitor.name = atom(name.c_str());
        monitor.primary = isFirst ? True : False;
        monitor.x = area.x();
        monitor.y = area.y();
        monitor.width = area.width();
        monitor.height = area.height();
        monitor.mwidth = area.width() / 4; // about 96 pixels an inch
        monitor.mheight = area.height() / 4;
        // The first monitor gets the server's only output, which ends the monitor that had it
        // before.
        monitor.noutput = isFirst ? 1 : 0;
        monitor.outputs = resources->outputs;
        XRRSetMonitor(m_display, root(), &monitor);
    }
    deleteMonitorsFrom(monitors.size());
    finish();
}

void XConnection::deleteMonitorsFrom(std::size_t index) const
{
    int count = 0;
    const std::unique_ptr<XRRMonitorInfo, decltype(&XRRFreeMonitors)> present(
        XRRGetMonitors(m_display, root(), False, &count), &XRRFreeMonitors);
    for (; index < static_cast<std::size_t>(count); ++index) {
        const std::string name = "monitor" + std::to_string(index);
        XRRDeleteMonitor(m_display, root(), atom(name.c_str()));
    }
}

void XConnection::finish() const
{
    XSync(m_display, False);
}

void XConnection::awaitWindowManager(ProbeWith question)
{
    m_question = question;
    // A window manager announces itself before it handles events, and a question that comes in
    // between may wait until another event comes. So it is asked again and again.
    const Window firstProbe = makeProbe();
    require(
        [this, firstProbe] {
            askWindowManager(firstProbe);
            return hasAnswered(firstProbe);
        },
        "the window manager to answer");
    XDestroyWindow(m_display, firstProbe); // its other answers are of no use
    m_probe = makeProbe();
}

void XConnection::finishWithWindowManager() const
{
    finish();
    if (!m_probe)
        return;
    // The window manager handles its events in order, so its answer to this one comes last.
    askWindowManager(m_probe);
    require([this] { return hasAnswered(m_probe); }, "the window manager to answer");
}

unsigned long XConnection::makeProbe() const
{
    const Window probe = XCreateSimpleWindow(m_display, root(), 0, 0, 1, 1, 0, 0, 0);
    XSelectInput(m_display, probe, PropertyChangeMask);
    finish();
    return probe;
}

void XConnection::askWindowManager(unsigned long probe) const
{
    if (m_question == ProbeWith::SelectionQuestion) {
        XConvertSelection(
            m_display, atom("WM_S0"), atom("VERSION"), atom("VERSION"), probe, CurrentTime);
        finish();
        return;
    }
    XEvent event {};
    event.xclient.type = ClientMessage;
    event.xclient.window = probe;
    event.xclient.message_type = atom("_NET_REQUEST_FRAME_EXTENTS");
    event.xclient.format = 32;
    XSendEvent(m_display, root(), False, SubstructureRedirectMask | SubstructureNotifyMask, &event);
    finish();
}

bool XConnection::hasAnswered(unsigned long probe) const
{
    XEvent change {};
    if (m_question == ProbeWith::SelectionQuestion)
        return XCheckTypedWindowEvent(m_display, probe, SelectionNotify, &change);
    // Openbox sets other properties on the way; only this one is the answer.
    const Atom wanted = atom("_NET_FRAME_EXTENTS");
    while (XCheckTypedWindowEvent(m_display, probe, PropertyNotify, &change)) {
        if (change.xproperty.atom == wanted)
            return true;
    }
    return false;
}

} // namespace penwick::desktop
