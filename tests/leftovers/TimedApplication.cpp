// SPDX-License-Identifier: MIT
#include "leftovers/TimedApplication.h"

#include <QEvent>
#include <QMetaEnum>

#include <utility>

namespace penwick::test {

bool TimedApplication::notify(QObject *receiver, QEvent *event)
{
    using Clock = std::chrono::steady_clock;
    if (m_depth > 0)
        return QApplication::notify(receiver, event);
    // Both may be gone afterwards.
    const char *const className = receiver->metaObject()->className();
    const QEvent::Type type = event->type();
    ++m_depth;
    const auto start = Clock::now();
    const bool result = QApplication::notify(receiver, event);
    const auto time = std::chrono::duration_cast<std::chrono::microseconds>(Clock::now() - start);
    --m_depth;
    if (time > m_longest.time) {
        const char *const name = QMetaEnum::fromType<QEvent::Type>().valueToKey(type);
        m_longest = { time, QByteArray(className) + ": " + (name ? name : "unnamed event") };
    }
    return result;
}

TimedApplication::Block TimedApplication::takeLongestBlock()
{
    return std::exchange(m_longest, {});
}

} // namespace penwick::test
