// SPDX-License-Identifier: MIT
// One session after another, each opened, used and ended the way a host or a user does it.
#pragma once

#include "leftovers/Hand.h"
#include "leftovers/Route.h"

#include <penwick/Penwick.h>

#include <chrono>
#include <map>
#include <memory>
#include <vector>

namespace penwick::test {

/// Opens the kinds of drawing windows in turn, uses them, and ends them by each route in turn. GUI
/// thread only.
class Sessions final
{
public:
    /// How many there are until each route was taken with each kind of window.
    [[nodiscard]] static int wholeRound();

    /// Reserves the memory for its notes on `count` sessions, which would otherwise look as if the
    /// sessions left it behind.
    explicit Sessions(int count);
    ~Sessions();
    Sessions(const Sessions &) = delete;
    Sessions &operator=(const Sessions &) = delete;

    /// Runs them. Returns whether each ended as it should; says on standard error what
    /// did not.
    [[nodiscard]] bool run();

    /// What the windows of one kind cost.
    struct Cost
    {
        /// Processor time of the whole process, from the making of the Penwick until its window
        /// had been painted; of each session.
        std::vector<std::chrono::microseconds> openings;
        /// The longest that the host waited for its window to be made and shown, by the clock.
        std::chrono::microseconds longestCall { 0 };
    };
    [[nodiscard]] const std::map<WindowType, Cost> &costs() const { return m_costs; }
    /// How often each of allRoutes() was taken to its end.
    [[nodiscard]] const std::vector<int> &taken() const { return m_taken; }

private:
    [[nodiscard]] bool runOne(int number);
    [[nodiscard]] bool openAndSee(WindowType kind);
    void open(WindowType kind);
    void use(int number);
    [[nodiscard]] bool reach(Moment moment);
    void beginStroke();
    void beginEdit();
    [[nodiscard]] bool openPopover();
    [[nodiscard]] bool showBanner();
    void dropToolBarOutside();
    void end(End how);
    [[nodiscard]] platform::Window &window() const;
    [[nodiscard]] QWidget &canvas() const;

    const int m_count;
    Hand m_hand;
    std::unique_ptr<Penwick> m_penwick;
    std::vector<bool> m_ends;
    std::map<WindowType, Cost> m_costs;
    std::vector<int> m_taken;
};

} // namespace penwick::test
