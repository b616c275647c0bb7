// SPDX-License-Identifier: MIT
// What a drag costs near the end of one very long stroke, and at its start.
#include "Board.h"
#include "Figure.h"
#include "Turns.h"

#include <QString>

namespace penwick::bench {

namespace {

constexpr int segmentsBefore = 19'000;
constexpr int segmentsMeasured = 1'000;
constexpr int segmentsOfAStart = 100;
constexpr double longStep = 12.0; // so that it gets about the whole canvas, again and again

} // namespace

Figures longStrokeFigures()
{
    Board atEnd(0);
    Board atStart(0);
    Pen pen(3, longStep);
    platform::Point point = pen.putDown();
    atEnd.press(point);
    for (int segment = 0; segment < segmentsBefore; ++segment) {
        point = pen.next();
        atEnd.drag(point);
    }
    settle();

    Turns turns;
    const auto end = turns.add(
        [&](int) {
            atEnd.drag(point);
            paintMarked();
        },
        [&atEnd] { atEnd.takePointer(); });
    const auto start = turns.add(
        [&](int) {
            atStart.drag(point);
            paintMarked();
        },
        [&atStart] { atStart.takePointer(); });
    for (int segment = 0; segment < segmentsMeasured; ++segment) {
        if (segment % segmentsOfAStart == 0) {
            atStart.choose(QStringLiteral("clear"));
            atStart.press(point);
            settle();
        }
        point = pen.next();
        turns.take(1);
    }
    return { timeOf("2 drag in a stroke of 20,000 segments: its end against its start",
        turns.of(end), turns.of(start), { std::nullopt, 1.5 }) };
}

} // namespace penwick::bench
