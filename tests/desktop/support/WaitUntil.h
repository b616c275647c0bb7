// SPDX-License-Identifier: MIT
// Waiting for something that another process does: on the condition, with a bound.
#pragma once

#include <chrono>
#include <stdexcept>
#include <string>
#include <thread>

namespace penwick::desktop {

/// What a busy machine may need for anything that normally takes milliseconds.
inline constexpr std::chrono::milliseconds generousBound { 10'000 };

/// Asks `condition` until it holds. Returns whether it did within `bound`.
template <class Condition>
[[nodiscard]] bool waitUntil(Condition &&condition, std::chrono::milliseconds bound = generousBound)
{
    constexpr std::chrono::milliseconds betweenQuestions { 5 };
    const auto end = std::chrono::steady_clock::now() + bound;
    while (!condition()) {
        if (std::chrono::steady_clock::now() >= end)
            return condition();
        std::this_thread::sleep_for(betweenQuestions);
    }
    return true;
}

/// Like waitUntil(), but throws a runtime_error that names `what` when the bound passes.
template <class Condition>
void require(
    Condition &&condition, const std::string &what, std::chrono::milliseconds bound = generousBound)
{
    if (!waitUntil(condition, bound))
        throw std::runtime_error("waited in vain for " + what);
}

} // namespace penwick::desktop
