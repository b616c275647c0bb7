// SPDX-License-Identifier: MIT
// The window managers that the tests know, and what is each one's own.
#pragma once

#include <QMargins>

#include <string>
#include <vector>

namespace penwick::desktop {

enum class WindowManager
{
    None,
    Openbox,
    Xfwm4,
    Mutter, ///< of the first large desktop
    Kwin, ///< of the second
    Silent ///< the tests' own, which grants nothing and says nothing of it
};

/// How one is started, and in what it differs from the others.
struct ManagerTraits
{
    std::string name; ///< in the names of tests, and what the environment calls it
    std::vector<std::string> command = {}; ///< nothing for no window manager
    bool needsBus = false; ///< does not start, or has no settings, without a session bus
    bool composes = false; ///< is a compositing manager itself, from its start to its end
    bool hasFullScreenAboveAll
        = false; ///< what has the keys and fills the screen is above all else
    bool hasInvisibleBorders = false; ///< its frames' windows are larger than what is seen of them
    QMargins grips = {}; ///< how far outside the frame that is seen a hand takes it, pixels
    std::vector<std::string> environment = {}; ///< "NAME=value", beside the desktop's own
    std::vector<std::string> serverArguments = {}; ///< what it needs of the X server
};

[[nodiscard]] const ManagerTraits &traitsOf(WindowManager manager);

/// The one that tests run under which have no reason to name one: what the environment variable
/// PENWICK_WINDOW_MANAGER says, else openbox. Throws a runtime_error if it says something unknown.
[[nodiscard]] WindowManager chosenManager();

/// Those that tests run under which run under each: the one of the environment variable alone, or
/// without it those that every machine has that runs the tests, openbox and xfwm4.
[[nodiscard]] std::vector<WindowManager> eachManager();

} // namespace penwick::desktop
