// SPDX-License-Identifier: MIT
// Time that passes by itself, and that a test can let pass.
#pragma once

#include <QObject>
#include <QTimer>

#include <chrono>
#include <optional>
#include <vector>

namespace penwick::platform {

class Alarm;

/// A clock that never goes back. GUI thread only.
class Clock final
{
public:
    using Time = std::chrono::milliseconds; ///< since some moment, the same for all clocks

    /// The clock by which the desktop's answers are awaited.
    [[nodiscard]] static Clock &ofTheDesktop();
    /// The clock by which a user's move or pull counts as over when it does not go on.
    [[nodiscard]] static Clock &ofTheUser();

    [[nodiscard]] Time now() const;
    /// Lets `by` pass at once: every alarm that is due meanwhile rings inside this call, in the
    /// order of their times. For tests that leave nothing to luck.
    void letPass(Time by);

    /// Borrows `alarm` until it is removed.
    void add(Alarm &alarm) { m_alarms.push_back(&alarm); }
    void remove(Alarm &alarm) { std::erase(m_alarms, &alarm); }

private:
    [[nodiscard]] Alarm *firstDue(Time until) const;

    Time m_ahead {}; // of the machine's own clock
    std::vector<Alarm *> m_alarms;
};

/// Rings once, at a time of one clock.
class Alarm final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `clock`, which must outlive the alarm.
    explicit Alarm(Clock &clock, QObject *parent = nullptr);
    ~Alarm() override;

    /// Sets the alarm to `at`, in place of the time before. For a time that has passed it rings
    /// with the next turn of the event loop.
    void set(Clock::Time at);
    void cancel();
    [[nodiscard]] std::optional<Clock::Time> at() const { return m_at; }
    /// Rings at once, and not again until it is set again.
    void ring();

Q_SIGNALS:
    void rang();

private:
    Clock &m_clock;
    std::optional<Clock::Time> m_at;
    QTimer m_timer;
};

} // namespace penwick::platform
