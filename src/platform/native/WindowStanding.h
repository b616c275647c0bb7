// SPDX-License-Identifier: MIT
// How a window stands among the windows of other programs.
#pragma once

namespace penwick::platform {

/// What a desktop is to be told of a window before it is shown, beyond what the toolkit tells.
struct WindowStanding
{
    /// It is on every virtual desktop, even where the window that it stands above is on one.
    bool isOnAllDesktops = false;
    /// It belongs to another window and never gets the keys. It stays on the screen while another
    /// program is active.
    bool isPanel = false;
    /// It covers a screen above everything, another program's full screen among it.
    bool isLayer = false;
    /// Nobody but its own program shows, places or orders it. So it is in reach even where the
    /// desktop puts another program's full screen above all that it manages.
    bool isUnmanaged = false;

    friend bool operator==(const WindowStanding &, const WindowStanding &) = default;
};

} // namespace penwick::platform
