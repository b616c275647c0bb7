// SPDX-License-Identifier: MIT
#include "monkey/Monkey.h"

#include <algorithm>
#include <array>

namespace penwick::desktop {

namespace {

constexpr std::size_t longMemory = 40;
constexpr int besideWindow = 6; // pixels: its frame's edges are to be hit, too

std::string inWords(QPoint place)
{
    return " " + std::to_string(place.x()) + "," + std::to_string(place.y());
}

std::string inWords(MouseButton button)
{
    return " " + std::to_string(static_cast<int>(button));
}

} // namespace

Monkey::Monkey(Desktop &desktop, MonkeyHost &host, std::uint64_t seed)
    : m_desktop(desktop)
    , m_host(host)
    , m_random(seed)
{ }

// Not the library's distributions: they may differ from one machine to the next.
int Monkey::any(int bound)
{
    return static_cast<int>(m_random() % static_cast<std::uint64_t>(bound));
}

QPoint Monkey::anywhere()
{
    const QSize size = m_desktop.screen().size();
    return { any(size.width()), any(size.height()) };
}

// Presses elsewhere would be the window manager's, whose menu starts other programs.
std::optional<QPoint> Monkey::anyPlaceOnTheHost()
{
    std::vector<WindowId> windows = m_desktop.windows().ofProcess(m_host.processId());
    const std::vector<WindowId> all = windows;
    std::erase_if(
        windows, [this](WindowId window) { return !m_desktop.windows().isShown(window); });
    const QRect screen(QPoint(), m_desktop.screen().size());
    if (windows.empty()) {
        // Minimised, or sent to another desktop: a user finds it in the task bar.
        if (!all.empty() && ++m_actsWithoutWindow % 10 == 0)
            m_desktop.windows().activate(
                all[static_cast<std::size_t>(any(static_cast<int>(all.size())))]);
        return std::nullopt;
    }
    const WindowId window
        = windows[static_cast<std::size_t>(any(static_cast<int>(windows.size())))];
    const QRect frame = m_desktop.windows()
                            .outerFrame(window)
                            .adjusted(-besideWindow, -besideWindow, besideWindow, besideWindow)
                            .intersected(screen);
    if (frame.isEmpty())
        return std::nullopt;
    const QPoint place = frame.topLeft() + QPoint(any(frame.width()), any(frame.height()));
    const bool isOnAny = std::any_of(windows.begin(), windows.end(),
        [&](WindowId each) { return m_desktop.windows().outerFrame(each).contains(place); });
    return isOnAny ? std::optional(place) : std::nullopt;
}

MouseButton Monkey::anyButton()
{
    constexpr std::array buttons { MouseButton::Left, MouseButton::Left, MouseButton::Left,
        MouseButton::Left, MouseButton::Middle, MouseButton::Right };
    return buttons[static_cast<std::size_t>(any(static_cast<int>(buttons.size())))];
}

void Monkey::remember(const std::string &what)
{
    m_memory.push_back(what);
    if (m_memory.size() > longMemory)
        m_memory.pop_front();
}

int Monkey::act()
{
    const int choice = any(100);
    if (choice < 15)
        return move();
    if (choice < 25)
        return press();
    if (choice < 37)
        return release();
    if (choice < 55)
        return click();
    if (choice < 63)
        return doubleClick();
    if (choice < 73)
        return drag();
    if (choice < 77)
        return wheel();
    if (choice < 86)
        return write();
    if (choice < 94)
        return pressKey();
    if (choice < 99)
        return pressKeyWithModifier();
    return askWindowManager();
}

int Monkey::move()
{
    const QPoint place = any(3) ? anyPlaceOnTheHost().value_or(anywhere()) : anywhere();
    remember("move" + inWords(place));
    m_desktop.pointer().moveTo(place);
    return 1;
}

int Monkey::press()
{
    const MouseButton button = anyButton();
    const bool isHeld = std::find(m_held.begin(), m_held.end(), button) != m_held.end();
    const auto place = anyPlaceOnTheHost();
    if (isHeld || !place)
        return 1;
    remember("press" + inWords(button) + inWords(*place));
    m_desktop.pointer().moveTo(*place);
    m_desktop.pointer().press(button);
    m_held.push_back(button);
    return 2;
}

int Monkey::release()
{
    if (m_held.empty())
        return 1;
    const MouseButton button = m_held.front();
    remember("release" + inWords(button));
    m_held.erase(m_held.begin());
    m_desktop.pointer().release(button);
    return 1;
}

void Monkey::letGo()
{
    while (!m_held.empty())
        release();
}

int Monkey::click()
{
    letGo();
    const MouseButton button = anyButton();
    const auto place = anyPlaceOnTheHost();
    if (!place)
        return 1;
    remember("click" + inWords(button) + inWords(*place));
    m_desktop.pointer().click(*place, button);
    return 3;
}

int Monkey::doubleClick()
{
    letGo();
    const auto place = anyPlaceOnTheHost();
    if (!place)
        return 1;
    remember("double click" + inWords(*place));
    m_desktop.pointer().click(*place);
    m_desktop.pointer().click(*place);
    return 6;
}

int Monkey::drag()
{
    letGo();
    const auto start = anyPlaceOnTheHost();
    if (!start)
        return 1;
    const MouseButton button = anyButton();
    const int stops = 1 + any(8);
    remember("drag" + inWords(button) + inWords(*start) + " stops " + std::to_string(stops));
    m_desktop.pointer().moveTo(*start);
    m_desktop.pointer().press(button);
    for (int stop = 0; stop < stops; ++stop)
        m_desktop.pointer().moveTo(any(4) ? anyPlaceOnTheHost().value_or(*start) : anywhere());
    m_desktop.pointer().release(button);
    return stops + 3;
}

int Monkey::wheel()
{
    const auto place = anyPlaceOnTheHost();
    if (!place)
        return 1;
    remember("wheel" + inWords(*place));
    m_desktop.pointer().click(*place, static_cast<MouseButton>(4 + any(2)));
    return 3;
}

int Monkey::write()
{
    constexpr std::string_view letters = "abcdefghijklmnopqrstuvwxyz 0123456789BTEC";
    std::string text;
    for (int length = 1 + any(6); length > 0; --length)
        text += letters[static_cast<std::size_t>(any(static_cast<int>(letters.size())))];
    remember("write " + text);
    m_desktop.keyboard().type(text);
    return 2 * static_cast<int>(text.size());
}

int Monkey::pressKey()
{
    constexpr std::array keys { "Escape", "Escape", "Tab", "Return", "BackSpace", "BackSpace",
        "Delete", "Left", "Right", "Up", "Down", "Home", "End", "Prior", "Next", "space", "F10",
        "Insert" };
    const char *const key = keys[static_cast<std::size_t>(any(static_cast<int>(keys.size())))];
    remember(std::string("key ") + key);
    m_desktop.keyboard().press(key);
    return 2;
}

int Monkey::pressKeyWithModifier()
{
    constexpr std::array<std::pair<const char *, const char *>, 22> keys { { { "Control_L", "z" },
        { "Control_L", "z" }, { "Control_L", "z" }, { "Control_L", "y" }, { "Control_L", "y" },
        { "Control_L", "a" }, { "Control_L", "c" }, { "Control_L", "v" }, { "Control_L", "x" },
        { "Control_L", "Delete" }, { "Control_L", "BackSpace" }, { "Control_L", "Left" },
        { "Control_L", "End" }, { "Control_L", "w" }, { "Shift_L", "Tab" }, { "Shift_L", "Left" },
        { "Shift_L", "Home" }, { "Shift_L", "Return" }, { "Shift_L", "F10" }, { "Alt_L", "Tab" },
        { "Alt_L", "Escape" }, { "Alt_L", "F4" } } };
    const auto &[modifier, key]
        = keys[static_cast<std::size_t>(any(static_cast<int>(keys.size())))];
    remember(std::string("key ") + modifier + " " + key);
    m_desktop.keyboard().pressWith(modifier, key);
    return 4;
}

int Monkey::askWindowManager()
{
    const std::vector<WindowId> windows = m_desktop.windows().ofProcess(m_host.processId());
    if (windows.empty())
        return 1;
    const WindowId window
        = windows[static_cast<std::size_t>(any(static_cast<int>(windows.size())))];
    switch (any(5)) {
    case 0:
        remember("minimise");
        m_desktop.windows().minimise(window);
        break;
    case 1:
        remember("close");
        m_desktop.windows().close(window);
        break;
    default:
        remember("activate");
        m_desktop.windows().activate(window);
    }
    return 1;
}

} // namespace penwick::desktop
