// SPDX-License-Identifier: MIT
// What the window manager and everybody else sees of the windows.
#pragma once

#include <QRect>
#include <QString>

#include <optional>
#include <string>
#include <vector>

namespace penwick::desktop {

class XConnection;

using WindowId = unsigned long;

/// What of a frame's window is seen.
enum class FrameBorders
{
    Visible,
    PartlyInvisible ///< around the visible part is more, to take the window by
};

/// Window properties, frames and order, read from the server at each call, and the requests that a
/// task bar would send. A window that is gone has empty answers.
class Windows final
{
public:
    /// Borrows `connection`, which must live longer.
    explicit Windows(const XConnection &connection, FrameBorders borders = FrameBorders::Visible);

    /// Windows that the window manager manages, and those that a program shows without it, the
    /// undermost first; without a window manager all that are shown.
    [[nodiscard]] std::vector<WindowId> stackingOrder() const;
    /// Menus, lists and the like: what programs show without the window manager, whose own windows
    /// have no class. Also those that tell no process.
    [[nodiscard]] std::vector<WindowId> lists() const;
    /// The area of what is in front at a place of the screen, with its title bar.
    [[nodiscard]] QRect inFrontAt(QPoint place) const;
    /// Those of process `processId`, the undermost first.
    [[nodiscard]] std::vector<WindowId> ofProcess(int processId) const;
    /// Whether there is a window manager.
    [[nodiscard]] bool areManaged() const;
    /// Whether the window manager tells the frame of a window that is not shown yet.
    [[nodiscard]] bool canTellFrames() const;
    [[nodiscard]] WindowId active() const; ///< 0 if there is none

    [[nodiscard]] QString title(WindowId window) const;
    [[nodiscard]] QRect clientArea(WindowId window) const; ///< screen pixels from the top left
    /// What is seen of it with its title bar, likewise.
    [[nodiscard]] QRect outerFrame(WindowId window) const;

    /// The 32-bit numbers (or atoms, or windows) of a property, empty if it is not set.
    [[nodiscard]] std::vector<unsigned long> numbers(WindowId window, const char *property) const;
    /// The same as text, for an 8-bit property.
    [[nodiscard]] std::optional<QString> text(WindowId window, const char *property) const;
    /// The names of a property's atoms, in no order that means anything.
    [[nodiscard]] std::vector<std::string> atoms(WindowId window, const char *property) const;
    [[nodiscard]] WindowId root() const;

    /// What a press on the title bar's close button asks for.
    void close(WindowId window);
    /// What a press on the title bar's minimise button asks for.
    void minimise(WindowId window);
    /// Brings a minimised window back, and any window to the front.
    void activate(WindowId window);
    /// Takes the connection to the server away from the program whose window it is.
    void cutOff(WindowId window);
    /// Goes to another virtual desktop, counted from 0, and returns once it is the present one.
    /// Where there are fewer it asks for more.
    void switchToDesktop(unsigned long number);
    /// Whether the window is on the screen, be it covered or not.
    [[nodiscard]] bool isShown(WindowId window) const;

private:
    [[nodiscard]] bool isUnmanaged(WindowId window) const;
    void ask(WindowId window, const char *what, long first, long second);

    const XConnection &m_connection;
    const FrameBorders m_borders;
};

} // namespace penwick::desktop
