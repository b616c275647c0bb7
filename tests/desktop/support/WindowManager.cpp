// SPDX-License-Identifier: MIT
#include "desktop/support/WindowManager.h"

#include <array>
#include <cstddef>
#include <cstdlib>
#include <stdexcept>

namespace penwick::desktop {

namespace {

const char *chosenName()
{
    const char *const name = std::getenv("PENWICK_WINDOW_MANAGER");
    return name && *name ? name : nullptr;
}

// In the enumeration's order.
const std::array<ManagerTraits, 6> &allTraits()
{
    static const std::array<ManagerTraits, 6> traits {
        ManagerTraits { .name = "none" },
        ManagerTraits { .name = "openbox",
            .command = { "openbox", "--sm-disable" },
            .hasFullScreenAboveAll = true },
        ManagerTraits {
            .name = "xfwm4", .command = { "xfwm4", "--compositor=off" }, .needsBus = true },
        // It paints with OpenGL, also what it composes, and a private server has no graphics card.
        ManagerTraits { .name = "mutter",
            .command = { "mutter", "--x11" },
            .needsBus = true,
            .composes = true,
            .hasInvisibleBorders = true,
            .grips = { 4, 4, 4, 4 },
            .environment = { "LIBGL_ALWAYS_SOFTWARE=1", "GSETTINGS_BACKEND=memory" },
            .serverArguments = { "+extension", "GLX", "+extension", "RANDR" } },
        // Not composing: with picom beside it, it is as openbox is, and starts in a third of a
        // second.
        ManagerTraits { .name = "kwin",
            .command = { "kwin_x11" },
            .needsBus = true,
            .grips = { 3, 0, 3, 3 },
            .environment = { "KWIN_COMPOSE=N", "LIBGL_ALWAYS_SOFTWARE=1" },
            .serverArguments = { "+extension", "GLX", "+extension", "RANDR" } },
        ManagerTraits { .name = "silent", .command = { PENWICK_SILENT_MANAGER } },
    };
    return traits;
}

} // namespace

const ManagerTraits &traitsOf(WindowManager manager)
{
    return allTraits().at(static_cast<std::size_t>(manager));
}

WindowManager chosenManager()
{
    const char *const name = chosenName();
    if (!name)
        return WindowManager::Openbox;
    for (const WindowManager manager : { WindowManager::Openbox, WindowManager::Xfwm4,
             WindowManager::Mutter, WindowManager::Kwin }) {
        if (traitsOf(manager).name == name)
            return manager;
    }
    throw std::runtime_error(std::string("no window manager is called ") + name);
}

std::vector<WindowManager> eachManager()
{
    if (chosenName())
        return { chosenManager() };
    return { WindowManager::Openbox, WindowManager::Xfwm4 };
}

} // namespace penwick::desktop
