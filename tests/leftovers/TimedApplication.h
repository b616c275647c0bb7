// SPDX-License-Identifier: MIT
// An application that knows how long its event loop was kept busy by one thing.
#pragma once

#include <QApplication>

#include <chrono>

namespace penwick::test {

/// Times every event that is not delivered inside another one.
class TimedApplication final : public QApplication
{
public:
    using QApplication::QApplication;

    bool notify(QObject *receiver, QEvent *event) override;

    /// The longest delivery since the last call of this, and what it was.
    struct Block
    {
        std::chrono::microseconds time { 0 };
        QByteArray what; ///< "class of the receiver: type of the event"
    };
    [[nodiscard]] Block takeLongestBlock();

private:
    Block m_longest;
    int m_depth = 0;
};

} // namespace penwick::test
