// SPDX-License-Identifier: MIT
#include "Growth.h"

#include "Board.h"
#include "Turns.h"

#include <QString>

#include <cstdio>

namespace penwick::bench {

namespace {

constexpr int stops[] { 0, 1'000, 2'000, 5'000, 10'000, 20'000, 30'000, 40'000, 50'000, 60'000,
    70'000, 80'000, 90'000, 100'000 };
constexpr int missesAtOnce = 64;

double dragTime(Board &board, Pen &pen)
{
    constexpr int strokes = 15;
    platform::Point point;
    Turns turns;
    turns.add([&](int) {
        board.drag(point);
        paintMarked();
    });
    board.choose(QStringLiteral("brush"));
    for (int stroke = 0; stroke < strokes; ++stroke) {
        board.press(pen.putDown());
        settle();
        for (int segment = 0; segment < segmentsOfAStroke; ++segment) {
            point = pen.next();
            turns.take(1);
        }
    }
    return turns.of(0).cpu();
}

double missTime(Board &board)
{
    const auto places = freePlaces();
    std::size_t turn = 0;
    Turns turns;
    turns.add(
        [&](int) {
            for (int event = 0; event < missesAtOnce; ++event) {
                board.drag(around(places[turn % places.size()], event));
                paintMarked();
            }
        },
        [&] { board.press(around(places[++turn % places.size()], 0)); }, missesAtOnce);
    board.choose(QStringLiteral("eraser"));
    settle();
    turns.take(100);
    return turns.of(0).cpu();
}

double undoTime(Board &board, Pen &pen)
{
    constexpr int rounds = 6;
    constexpr int undosOfARound = 5;
    Turns turns;
    turns.add([&board](int) {
        board.choose(QStringLiteral("undo"));
        paintMarked();
    });
    for (int round = 0; round < rounds; ++round) {
        for (int stroke = 0; stroke < undosOfARound; ++stroke)
            board.draw(pen);
        turns.take(undosOfARound);
    }
    return turns.of(0).cpu();
}

double exposeTime(Board &board)
{
    Turns turns;
    turns.add([&board](int) {
        board.expose();
        paintMarked();
    });
    turns.take(40);
    return turns.of(0).cpu();
}

} // namespace

void printGrowth()
{
    Board board(0);
    Pen content(7);
    Pen pen(19);
    std::printf("strokes,drag,eraser_miss,undo,expose\n");
    for (const int strokes : stops) {
        board.scribble(content, strokes - board.strokes().size());
        const double miss = missTime(board);
        const double expose = exposeTime(board);
        const double drag = dragTime(board, pen);
        const double undo = undoTime(board, pen);
        std::printf("%d,%.3f,%.3f,%.3f,%.3f\n", strokes, drag, miss, undo, expose);
        std::fflush(stdout);
    }
}

} // namespace penwick::bench
