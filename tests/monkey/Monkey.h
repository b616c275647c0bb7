// SPDX-License-Identifier: MIT
// Pointer and keys in hands that know nothing.
#pragma once

#include "desktop/support/Desktop.h"
#include "monkey/MonkeyHost.h"

#include <QPoint>

#include <deque>
#include <optional>
#include <random>
#include <string>
#include <string_view>
#include <vector>

namespace penwick::desktop {

/// Does random things to the windows of one host, the same ones for the same seed as long as the
/// desktop answers alike.
class Monkey final
{
public:
    /// Borrows both.
    Monkey(Desktop &desktop, MonkeyHost &host, std::uint64_t seed);

    /// Does one thing, and returns how many events it took.
    int act();
    /// Lets go of every button that is held down.
    void letGo();
    /// The last things that were done, the oldest first.
    [[nodiscard]] const std::deque<std::string> &memory() const { return m_memory; }

private:
    [[nodiscard]] int any(int bound); ///< 0 up to, not including, `bound`
    [[nodiscard]] QPoint anywhere();
    [[nodiscard]] std::optional<QPoint> anyPlaceOnTheHost();
    [[nodiscard]] MouseButton anyButton();

    int move();
    int press();
    int release();
    int click();
    int doubleClick();
    int drag();
    int wheel();
    int write();
    int pressKey();
    int pressKeyWithModifier();
    int askWindowManager();
    void remember(const std::string &what);

    Desktop &m_desktop;
    MonkeyHost &m_host;
    std::mt19937_64 m_random;
    std::vector<MouseButton> m_held;
    std::deque<std::string> m_memory;
    int m_actsWithoutWindow = 0;
};

} // namespace penwick::desktop
