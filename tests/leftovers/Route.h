// SPDX-License-Identifier: MIT
// How a session ends, and in the middle of what.
#pragma once

#include <vector>

namespace penwick::test {

/// What is under way when a session ends.
enum class Moment
{
    Rest,
    Stroke, ///< the pointer is down on the canvas and has moved
    Edit, ///< a text box is being typed into
    Popover, ///< one is open
    Banner, ///< within its 1.5 s
    Settling, ///< the tool bar was let go of outside the window, and is about to be pulled back
    Glide ///< it is on its way back
};

/// Who ends it.
enum class End
{
    EndButton, ///< pressed on the tool bar
    TitleBar, ///< what the desktop sends for its close button, or for Alt+F4
    HostCloses,
    HostDrops ///< lets go of everything, which posts no end
};

struct Route
{
    Moment moment;
    End end;
};

/// Each end at each moment, but the button in the middle of a stroke: there is one pointer.
[[nodiscard]] const std::vector<Route> &allRoutes();

/// Writes to standard output, as a table, how often each of allRoutes() was taken.
void sayRoutes(const std::vector<int> &taken);

} // namespace penwick::test
