// SPDX-License-Identifier: MIT
#include "Turns.h"

#include "Board.h"

#include <utility>

namespace penwick::bench {

std::size_t Turns::add(Event event, std::function<void()> prepare, int events)
{
    m_measured.push_back({ std::move(event), std::move(prepare), events, {} });
    return m_measured.size() - 1;
}

void Turns::take(int rounds)
{
    for (int round = 0; round < rounds; ++round, ++m_next) {
        for (std::size_t turn = 0; turn < m_measured.size(); ++turn) {
            const std::size_t place = (turn + static_cast<std::size_t>(m_next)) % m_measured.size();
            Measured &measured = m_measured[place];
            if (measured.prepare)
                measured.prepare();
            const Stopwatch watch;
            measured.event(m_next);
            measured.samples.add(watch.elapsed(), measured.events);
            settle();
        }
    }
}

} // namespace penwick::bench
