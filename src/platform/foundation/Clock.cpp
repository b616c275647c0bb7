// SPDX-License-Identifier: MIT
#include "platform/foundation/Clock.h"

#include <algorithm>

namespace penwick::platform {

Clock &Clock::ofTheDesktop()
{
    // Never destroyed, because a host may keep windows until the very end of the process.
    static Clock &clock = *new Clock;
    return clock;
}

Clock &Clock::ofTheUser()
{
    static Clock &clock = *new Clock;
    return clock;
}

Clock::Time Clock::now() const
{
    return m_ahead
        + std::chrono::duration_cast<Time>(std::chrono::steady_clock::now().time_since_epoch());
}

void Clock::letPass(Time by)
{
    const Time end = now() + by;
    while (Alarm *const alarm = firstDue(end)) {
        m_ahead += std::max(Time(), *alarm->at() - now());
        alarm->ring();
    }
    m_ahead += std::max(Time(), end - now());
}

Alarm *Clock::firstDue(Time until) const
{
    Alarm *first = nullptr;
    for (Alarm *const alarm : m_alarms) {
        if (alarm->at() && *alarm->at() <= until && (!first || *alarm->at() < *first->at()))
            first = alarm;
    }
    return first;
}

Alarm::Alarm(Clock &clock, QObject *parent)
    : QObject(parent)
    , m_clock(clock)
    , m_timer(this)
{
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &Alarm::ring);
    m_clock.add(*this);
}

Alarm::~Alarm()
{
    m_clock.remove(*this);
}

void Alarm::set(Clock::Time at)
{
    m_at = at;
    m_timer.start(std::max(Clock::Time(), at - m_clock.now()));
}

void Alarm::cancel()
{
    m_at.reset();
    m_timer.stop();
}

void Alarm::ring()
{
    cancel();
    Q_EMIT rang();
}

} // namespace penwick::platform
