// SPDX-License-Identifier: MIT
// What a drag of the brush costs on a full canvas, on an empty one and at the least.
#include "Board.h"
#include "Figure.h"
#include "Floor.h"
#include "Turns.h"

#include <QString>

namespace penwick::bench {

namespace {

constexpr int manyStrokes = 10'000;
constexpr int measuredStrokes = 150;
constexpr int mostOnEmptyCanvas = 5; // strokes, then it is emptied again

} // namespace

Figures dragFigures()
{
    Board full(manyStrokes);
    Board empty(0);
    Floor floor;
    Pen pen(1);
    platform::Point point;
    Turns turns;
    const auto onFull = turns.add(
        [&](int) {
            full.drag(point);
            paintMarked();
        },
        [&full] { full.takePointer(); });
    const auto onEmpty = turns.add(
        [&](int) {
            empty.drag(point);
            paintMarked();
        },
        [&empty] { empty.takePointer(); });
    const auto onFloor = turns.add([&](int) {
        floor.drag(point);
        paintMarked();
    });

    for (int stroke = 0; stroke < measuredStrokes; ++stroke) {
        if (stroke % mostOnEmptyCanvas == 0)
            empty.choose(QStringLiteral("clear"));
        point = pen.putDown();
        full.press(point);
        empty.press(point);
        floor.press(point);
        settle();
        for (int segment = 0; segment < segmentsOfAStroke; ++segment) {
            point = pen.next();
            turns.take(1);
        }
    }
    return {
        timeOf("1 drag of the brush: 10,000 strokes against none", turns.of(onFull),
            turns.of(onEmpty), { std::nullopt, 1.10 }),
        timeOf("1 drag of the brush: 10,000 strokes against the floor", turns.of(onFull),
            turns.of(onFloor), { std::nullopt, 1.5 }),
    };
}

} // namespace penwick::bench
