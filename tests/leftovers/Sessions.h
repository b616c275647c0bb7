// SPDX-License-Identifier: MIT
// One session after another, each opened, used and ended the way a host does it.
#pragma once

#include <penwick/Penwick.h>

#include <chrono>
#include <map>
#include <memory>
#include <vector>

namespace penwick::leftovers {

/// Opens the kinds of drawing windows in turn, uses them and ends them, in each way in turn: closed
/// by the host, by the tool that ends the session, and by being let go of. GUI thread only.
class Sessions final
{
public:
    /// What it writes down of `count` sessions has its memory from the beginning.
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

private:
    enum class End
    {
        ByTheHost,
        ByTheTool,
        ByLettingGo
    };

    [[nodiscard]] bool runOne(int number);
    void open(WindowType kind);
    void use(int number);
    void end(End how);
    const int m_count;
    std::unique_ptr<Penwick> m_penwick;
    std::vector<bool> m_ends;
    std::map<WindowType, Cost> m_costs;
};

} // namespace penwick::leftovers
