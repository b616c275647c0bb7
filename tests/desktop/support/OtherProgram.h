// SPDX-License-Identifier: MIT
// Somebody else's window on the desktop, of one colour, for what is drawn over it.
#pragma once

#include "desktop/support/Windows.h"

#include <QColor>
#include <QRect>

#include <memory>

namespace penwick::desktop {

class Desktop;
class XConnection;

/// A window of another program: with a connection of its own, and without a process id that would
/// make it one of the host's. Gone with this object.
class OtherProgram final
{
public:
    enum class Kind
    {
        Ordinary, ///< with a title bar around it
        Dock, ///< a panel of the desktop, above ordinary windows
        FullScreen ///< the window manager makes it as large as the screen
    };

    /// Opens the window with its content at `area` and returns once it is shown.
    OtherProgram(
        Desktop &desktop, const QRect &area, const QColor &color, Kind kind = Kind::Ordinary);
    ~OtherProgram();

    [[nodiscard]] WindowId window() const { return m_window; }
    /// Its content on the screen.
    [[nodiscard]] QRect area() const;
    /// How often a button was pressed on it so far.
    [[nodiscard]] int presses();
    /// Paints it anew in another colour.
    void turn(const QColor &color);
    /// Brings it before the others, as far as the window manager lets it.
    void raise();

private:
    void say(const char *property, const char *what);

    Desktop &m_desktop;
    const std::unique_ptr<XConnection> m_connection;
    WindowId m_window = 0;
    int m_presses = 0;
};

} // namespace penwick::desktop
