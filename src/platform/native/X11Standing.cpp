// SPDX-License-Identifier: MIT
#include "platform/native/X11Standing.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>
#include <utility>

namespace penwick::platform {

namespace {

constexpr std::uint32_t allDesktops = 0xFFFFFFFF;

constexpr std::uint8_t sentByAnotherClient = 0x80;
constexpr std::uint32_t moreThanThereAre = 64; // states of a window, and protocols

// What a window manager says of a window.
constexpr std::uint32_t withdrawn = 0;
constexpr std::uint32_t iconic = 3;

} // namespace

X11Standing::X11Standing(const X11Client &client)
    : m_client(client)
    , m_desktop(client.atom("_NET_WM_DESKTOP"))
    , m_type(client.atom("_NET_WM_WINDOW_TYPE"))
    , m_iconState(client.atom("WM_STATE"))
    , m_state(client.atom("_NET_WM_STATE"))
    , m_hidden(client.atom("_NET_WM_STATE_HIDDEN"))
{
    QCoreApplication::instance()->installNativeEventFilter(this);
}

X11Standing::~X11Standing() = default;

void X11Standing::prepare(xcb_window_t window, const WindowStanding &standing)
{
    const std::uint32_t overrideRedirect = standing.isUnmanaged ? 1 : 0;
    xcb_change_window_attributes(
        m_client.connection(), window, XCB_CW_OVERRIDE_REDIRECT, &overrideRedirect);
    if (standing.isPanel || standing.isLayer)
        writeTypes(window, standing);
    if (standing.isPanel)
        refuseKeys(window);
    // Openbox takes a panel's parent along when the panel is asked to be on all desktops, so the
    // panel has to be so from the beginning.
    if (standing.isOnAllDesktops)
        m_client.setNumbers(window, m_desktop, XCB_ATOM_CARDINAL, { allDesktops });
    forget(window);
    m_prepared.push_back({ window, standing, standing.isOnAllDesktops });
}

// The first that a window manager knows counts. Of the types that KWin keeps above the active full
// screen, the one for urgent notes may get the keys and stays where it was put. A panel is a
// dialog, although the toolkit calls it a utility window: KWin hides those of a program that is not
// the active one.
void X11Standing::writeTypes(xcb_window_t window, const WindowStanding &standing) const
{
    const xcb_atom_t own
        = m_client.atom(standing.isLayer ? "_KDE_NET_WM_WINDOW_TYPE_CRITICAL_NOTIFICATION"
                                         : "_NET_WM_WINDOW_TYPE_DIALOG");
    const xcb_atom_t withoutBorders = m_client.atom("_KDE_NET_WM_WINDOW_TYPE_OVERRIDE");
    m_client.setNumbers(window, m_type, XCB_ATOM_ATOM,
        { own, withoutBorders, m_client.atom("_NET_WM_WINDOW_TYPE_NORMAL") });
}

// The toolkit says of every window that it takes the keys when it is given them. Window managers
// would offer such a dialog to whoever goes from window to window by keys.
void X11Standing::refuseKeys(xcb_window_t window) const
{
    const xcb_atom_t protocols = m_client.atom("WM_PROTOCOLS");
    auto known = m_client.numbers(window, protocols, XCB_ATOM_ATOM, moreThanThereAre);
    if (std::erase(known, m_client.atom("WM_TAKE_FOCUS")) > 0)
        m_client.setNumbers(window, protocols, XCB_ATOM_ATOM, known);
}

void X11Standing::forget(xcb_window_t window)
{
    std::erase_if(m_prepared, [window](const Prepared &each) { return each.window == window; });
}

X11Standing::Prepared *X11Standing::find(xcb_window_t window)
{
    const auto found = std::ranges::find(m_prepared, window, &Prepared::window);
    return found == m_prepared.end() ? nullptr : &*found;
}

bool X11Standing::nativeEventFilter(const QByteArray &eventType, void *message, qintptr *)
{
    if (eventType != QByteArrayLiteral("xcb_generic_event_t"))
        return false;
    const auto *const event = static_cast<const xcb_generic_event_t *>(message);
    switch (event->response_type & ~sentByAnotherClient) {
    case XCB_CONFIGURE_NOTIFY:
        onStacked(*static_cast<const xcb_configure_notify_event_t *>(message));
        return false;
    case XCB_REPARENT_NOTIFY:
        onReparented(*static_cast<const xcb_reparent_notify_event_t *>(message));
        return false;
    case XCB_PROPERTY_NOTIFY:
        return onPropertyChanged(*static_cast<const xcb_property_notify_event_t *>(message));
    default:
        return false;
    }
}

bool X11Standing::onPropertyChanged(const xcb_property_notify_event_t &event)
{
    Prepared *const prepared = find(event.window);
    if (!prepared)
        return false;
    if (event.atom == m_desktop && prepared->awaitsDesktop)
        onDesktopTold(*prepared);
    if (event.atom == m_iconState || event.atom == m_state)
        return onStateTold(*prepared, event);
    return false;
}

// Nobody but this keeps unmanaged panels above their layer when a window manager raises that, goes,
// or comes back.
void X11Standing::onStacked(const xcb_configure_notify_event_t &event) const
{
    const bool isLayers = std::ranges::any_of(m_prepared, [&event](const Prepared &each) {
        return each.standing.isLayer && (each.window == event.window || each.frame == event.window);
    });
    if (isLayers)
        raisePanels();
}

void X11Standing::onReparented(const xcb_reparent_notify_event_t &event)
{
    Prepared *const prepared = find(event.window);
    if (!prepared || !prepared->standing.isLayer)
        return;
    prepared->frame = m_client.childOfRootAround(event.window);
    raisePanels();
}

// Only those that a layer covers: a panel is not to come above a menu or a tool tip. An error means
// that the layer is just being framed anew, of which there will be another event.
void X11Standing::raisePanels() const
{
    for (const Prepared &panel : m_prepared) {
        for (const Prepared &layer : m_prepared) {
            if (!panel.standing.isUnmanaged || !layer.standing.isLayer)
                continue;
            const std::array<std::uint32_t, 2> values { layer.frame ? layer.frame : layer.window,
                XCB_STACK_MODE_TOP_IF };
            const auto request = xcb_configure_window_checked(m_client.connection(), panel.window,
                XCB_CONFIG_WINDOW_SIBLING | XCB_CONFIG_WINDOW_STACK_MODE, values.data());
            xcb_discard_reply(m_client.connection(), request.sequence);
        }
    }
    xcb_flush(m_client.connection());
}

// Some window managers put the window on one desktop although it said all, and have to be asked
// once it is there. Mutter has noted what it said, and does nothing when it is asked for that; it
// forgets it when it is asked for the one desktop.
void X11Standing::onDesktopTold(Prepared &prepared) const
{
    const auto told = m_client.numbers(prepared.window, m_desktop, XCB_ATOM_CARDINAL, 1);
    if (told.size() != 1)
        return;
    if (told.front() == allDesktops) {
        prepared.awaitsDesktop
            = managedState(prepared.window) == withdrawn; // it is what was written here
        return;
    }
    prepared.awaitsDesktop = false;
    for (const std::uint32_t wanted : { told.front(), allDesktops })
        m_client.askManager(prepared.window, m_desktop, wanted);
}

// Mutter and KWin call a window iconic that is on a virtual desktop which is not shown. The toolkit
// would take it for minimised, and the panels that are on all desktops would go with it. A
// minimised one is said to be hidden as well, be it before or after. Returns whether the toolkit is
// not to hear of it.
bool X11Standing::onStateTold(Prepared &prepared, const xcb_property_notify_event_t &event) const
{
    const bool isElsewhere = managedState(prepared.window) == iconic
        && !isSaidToBeHidden(prepared.window) && m_client.managerSupports(m_hidden);
    if (std::exchange(prepared.isElsewhere, isElsewhere) && !isElsewhere && event.atom == m_state)
        letToolkitLook(event);
    return isElsewhere && event.atom == m_iconState;
}

// The toolkit looks at a property when it is told that it has changed.
void X11Standing::letToolkitLook(const xcb_property_notify_event_t &event) const
{
    xcb_property_notify_event_t told = event;
    told.atom = m_iconState;
    m_client.sendToOwnProgram(event.window, told);
}

std::uint32_t X11Standing::managedState(xcb_window_t window) const
{
    const auto told = m_client.numbers(window, m_iconState, m_iconState, 1);
    return told.empty() ? withdrawn : told.front();
}

bool X11Standing::isSaidToBeHidden(xcb_window_t window) const
{
    const auto states = m_client.numbers(window, m_state, XCB_ATOM_ATOM, moreThanThereAre);
    return std::ranges::find(states, m_hidden) != states.end();
}

} // namespace penwick::platform
