// SPDX-License-Identifier: MIT
#include "desktop/support/Windows.h"

#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <QMargins>

#include <X11/Xlib.h>

#include <X11/Xatom.h>
#include <X11/Xutil.h>

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <memory>
#include <utility>

namespace penwick::desktop {

namespace {

constexpr long askedByUser = 2; // as a task bar asks

struct Property
{
    std::unique_ptr<unsigned char, int (*)(void *)> data { nullptr, &XFree };
    unsigned long count = 0;
};

Property read(const XConnection &connection, Window window, const char *name, int wantedFormat)
{
    constexpr long enough = 1 << 16; // in units of 4 bytes
    Atom type = 0;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    const int status = XGetWindowProperty(connection.display(), window, connection.atom(name), 0,
        enough, False, AnyPropertyType, &type, &format, &count, &left, &data);
    Property property;
    property.data.reset(data);
    if (status == Success && format == wantedFormat)
        property.count = count;
    return property;
}

struct Family
{
    Window parent = 0;
    std::vector<Window> children; // the undermost first
};

Family familyOf(const XConnection &connection, Window window)
{
    Window root = 0;
    Window *children = nullptr;
    unsigned int count = 0;
    Family family;
    if (!XQueryTree(connection.display(), window, &root, &family.parent, &children, &count))
        return family;
    const std::unique_ptr<Window, int (*)(void *)> owner(children, &XFree);
    family.children.assign(children, children + count);
    return family;
}

// The child of the root that holds `window`: the window manager's frame, or the window itself.
Window frameOf(const XConnection &connection, Window window)
{
    Window current = window;
    for (;;) {
        const Window parent = familyOf(connection, current).parent;
        if (parent == connection.root() || parent == 0)
            return current;
        current = parent;
    }
}

QRect rectangleOf(const XConnection &connection, Window window)
{
    XWindowAttributes attributes {};
    if (!XGetWindowAttributes(connection.display(), window, &attributes))
        return {};
    int x = 0;
    int y = 0;
    Window child = 0;
    const int border = attributes.border_width;
    XTranslateCoordinates(
        connection.display(), window, connection.root(), -border, -border, &x, &y, &child);
    return { x, y, attributes.width + 2 * border, attributes.height + 2 * border };
}

bool numbersBegin(const std::vector<unsigned long> &numbers, unsigned long first)
{
    return !numbers.empty() && numbers.front() == first;
}

// Both sorts of extents are told in the order left, right, top, bottom.
QMargins marginsFrom(const std::vector<unsigned long> &extents)
{
    return { static_cast<int>(extents[0]), static_cast<int>(extents[2]),
        static_cast<int>(extents[1]), static_cast<int>(extents[3]) };
}

} // namespace

Windows::Windows(const XConnection &connection, FrameBorders borders)
    : m_connection(connection)
    , m_borders(borders)
{ }

std::vector<WindowId> Windows::stackingOrder() const
{
    // Not the window manager's own list: some set it only when the order changes.
    const std::vector<Window> frames = familyOf(m_connection, root()).children;
    // Each is asked for once: a window may go while they are sorted.
    std::vector<std::pair<std::ptrdiff_t, WindowId>> byHeight;
    std::vector<WindowId> windows;
    const bool hasManager = areManaged();
    if (hasManager)
        windows = numbers(root(), "_NET_CLIENT_LIST");
    std::copy_if(frames.begin(), frames.end(), std::back_inserter(windows),
        [&](Window window) { return isShown(window) && (!hasManager || isUnmanaged(window)); });
    for (const WindowId window : windows) {
        const auto place = std::find(frames.begin(), frames.end(), frameOf(m_connection, window));
        byHeight.emplace_back(place - frames.begin(), window);
    }
    std::stable_sort(byHeight.begin(), byHeight.end(),
        [](const auto &one, const auto &other) { return one.first < other.first; });
    windows.clear();
    for (const auto &[height, window] : byHeight)
        windows.push_back(window);
    return windows;
}

std::vector<WindowId> Windows::lists() const
{
    constexpr int seenFrom = 20; // pixels; programs have smaller ones for their own ends
    std::vector<WindowId> found;
    for (const Window window : familyOf(m_connection, root()).children) {
        XWindowAttributes attributes {};
        if (XGetWindowAttributes(m_connection.display(), window, &attributes)
            && attributes.override_redirect && attributes.map_state == IsViewable
            && attributes.width >= seenFrom && attributes.height >= seenFrom
            && text(window, "WM_CLASS"))
            found.push_back(window);
    }
    return found;
}

QRect Windows::inFrontAt(QPoint place) const
{
    int x = 0;
    int y = 0;
    Window child = 0;
    XTranslateCoordinates(
        m_connection.display(), root(), root(), place.x(), place.y(), &x, &y, &child);
    return rectangleOf(m_connection, child);
}

std::vector<WindowId> Windows::ofProcess(int processId) const
{
    const std::vector<unsigned long> owner { static_cast<unsigned long>(processId) };
    std::vector<WindowId> windows = stackingOrder();
    std::erase_if(
        windows, [&](WindowId window) { return numbers(window, "_NET_WM_PID") != owner; });
    return windows;
}

bool Windows::areManaged() const
{
    // A window manager names a window of its own on the root, and that window names itself. When
    // the window manager has ended, the root's word may still be there, but not the window's.
    const char *const announcement = "_NET_SUPPORTING_WM_CHECK";
    const std::vector<unsigned long> check = numbers(root(), announcement);
    return check.size() == 1 && numbers(check.front(), announcement) == check
        && !numbers(root(), "_NET_SUPPORTED").empty();
}

// Whether a program, which is not the window manager, has asked the latter to leave alone this
// child of the root.
bool Windows::isUnmanaged(WindowId window) const
{
    XWindowAttributes attributes {};
    if (!XGetWindowAttributes(m_connection.display(), window, &attributes)
        || !attributes.override_redirect)
        return false;
    const std::vector<unsigned long> check = numbers(root(), "_NET_SUPPORTING_WM_CHECK");
    const std::vector<unsigned long> process = numbers(window, "_NET_WM_PID");
    // Not every window manager tells its process, but the numbers of all windows of one connection
    // begin alike.
    constexpr int ownDigits = 21; // bits, of up to 256 connections
    const bool isManagers = !check.empty()
        && (numbers(check.front(), "_NET_WM_PID") == process
            || check.front() >> ownDigits == window >> ownDigits);
    return !process.empty() && !isManagers;
}

bool Windows::canTellFrames() const
{
    const std::vector<std::string> supported = atoms(root(), "_NET_SUPPORTED");
    return std::find(supported.begin(), supported.end(), "_NET_REQUEST_FRAME_EXTENTS")
        != supported.end();
}

WindowId Windows::active() const
{
    const std::vector<unsigned long> windows = numbers(root(), "_NET_ACTIVE_WINDOW");
    return windows.empty() ? 0 : windows.front();
}

QString Windows::title(WindowId window) const
{
    return text(window, "_NET_WM_NAME").value_or(QString());
}

QRect Windows::clientArea(WindowId window) const
{
    return rectangleOf(m_connection, window);
}

QRect Windows::outerFrame(WindowId window) const
{
    // Who draws the frame itself says how much of its window is shadow.
    if (const std::vector<unsigned long> shadow = numbers(window, "_GTK_FRAME_EXTENTS");
        shadow.size() == 4)
        return clientArea(window).marginsRemoved(marginsFrom(shadow));
    const WindowId frame = frameOf(m_connection, window);
    if (m_borders == FrameBorders::PartlyInvisible && frame != window) {
        if (const std::vector<unsigned long> extents = numbers(window, "_NET_FRAME_EXTENTS");
            extents.size() == 4)
            return clientArea(window).marginsAdded(marginsFrom(extents));
    }
    return rectangleOf(m_connection, frame);
}

std::vector<unsigned long> Windows::numbers(WindowId window, const char *property) const
{
    const Property found = read(m_connection, window, property, 32);
    const auto *const first = reinterpret_cast<const unsigned long *>(found.data.get());
    std::vector<unsigned long> numbers(first, first + found.count);
    for (unsigned long &number : numbers)
        number &= 0xFFFFFFFFU; // handed out as signed ones, in longs
    return numbers;
}

std::optional<QString> Windows::text(WindowId window, const char *property) const
{
    const Property found = read(m_connection, window, property, 8);
    if (!found.data)
        return std::nullopt;
    return QString::fromUtf8(
        reinterpret_cast<const char *>(found.data.get()), static_cast<qsizetype>(found.count));
}

std::vector<std::string> Windows::atoms(WindowId window, const char *property) const
{
    std::vector<std::string> names;
    for (const Atom atom : numbers(window, property)) {
        const std::unique_ptr<char, int (*)(void *)> name(
            XGetAtomName(m_connection.display(), atom), &XFree);
        if (name)
            names.emplace_back(name.get());
    }
    return names;
}

WindowId Windows::root() const
{
    return m_connection.root();
}

void Windows::close(WindowId window)
{
    ask(window, "_NET_CLOSE_WINDOW", 0, askedByUser);
}

void Windows::minimise(WindowId window)
{
    ask(window, "WM_CHANGE_STATE", IconicState, 0);
}

void Windows::activate(WindowId window)
{
    ask(window, "_NET_ACTIVE_WINDOW", askedByUser, CurrentTime);
}

void Windows::cutOff(WindowId window)
{
    XKillClient(m_connection.display(), window);
    m_connection.finish();
}

void Windows::switchToDesktop(unsigned long number)
{
    const char *const count = "_NET_NUMBER_OF_DESKTOPS";
    const auto hasDesktop = [&] {
        const std::vector<unsigned long> desktops = numbers(root(), count);
        return desktops.size() == 1 && desktops.front() > number;
    };
    if (!hasDesktop()) {
        ask(root(), count, static_cast<long>(number) + 1, 0);
        require(hasDesktop, "one more virtual desktop");
    }
    ask(root(), "_NET_CURRENT_DESKTOP", static_cast<long>(number), CurrentTime);
    require(
        [&] {
            return numbers(root(), "_NET_CURRENT_DESKTOP") == std::vector<unsigned long> { number };
        },
        "another virtual desktop");
}

void Windows::ask(WindowId window, const char *what, long first, long second)
{
    XEvent event {};
    event.xclient.type = ClientMessage;
    event.xclient.window = window;
    event.xclient.message_type = m_connection.atom(what);
    event.xclient.format = 32;
    event.xclient.data.l[0] = first;
    event.xclient.data.l[1] = second;
    XSendEvent(m_connection.display(), root(), False,
        SubstructureRedirectMask | SubstructureNotifyMask, &event);
    m_connection.finish();
}

bool Windows::isShown(WindowId window) const
{
    XWindowAttributes attributes {};
    return XGetWindowAttributes(m_connection.display(), window, &attributes)
        && attributes.map_state == IsViewable
        // One that composes keeps what it does not show in the server, for its small pictures.
        && !numbersBegin(numbers(window, "WM_STATE"), IconicState);
}

} // namespace penwick::desktop
