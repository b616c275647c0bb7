// SPDX-License-Identifier: MIT
// How long what the pointer does takes as a drawing grows, and what a segment costs in memory.
#include "Board.h"
#include "RatioTable.h"

#include "appearance/PenwickBundle.h"
#include "canvas/DrawingCanvasModel.h"
#include "history/UndoRedoManager.h"

#include <benchmark/benchmark.h>

#include <QApplication>

#include <chrono>
#include <cstdio>
#include <map>
#include <memory>
#include <string>
#include <vector>

#ifdef PENWICK_HAS_MALLINFO2
#include <malloc.h>
#endif

namespace {

using penwick::bench::Board;

constexpr int emptyCanvas = 0;
constexpr int largeCanvas = 1'000;
constexpr int hugeCanvas = 10'000;
constexpr int repetitions = 5;

// Made once: painting the largest for the first time takes seconds.
std::map<int, std::unique_ptr<Board>> &boards()
{
    static std::map<int, std::unique_ptr<Board>> made;
    return made;
}

Board &boardOf(const benchmark::State &state)
{
    return *boards().at(static_cast<int>(state.range(0)));
}

void brushDrag(benchmark::State &state)
{
    using Clock = std::chrono::steady_clock;
    Board &board = boardOf(state);
    board.choose(QStringLiteral("brush"));
    board.press(board.nextPoint());
    board.drag(board.nextPoint());
    board.show(); // with whatever else was still to be painted
    int segments = 1;
    for (auto _ : state) {
        if (++segments > penwick::bench::segmentsOfAStroke) {
            board.forgetNewestStroke();
            board.press(board.nextPoint());
            segments = 1;
        }
        const penwick::platform::Point point = board.nextPoint();
        const auto start = Clock::now();
        board.drag(point);
        board.show();
        state.SetIterationTime(std::chrono::duration<double>(Clock::now() - start).count());
    }
    board.forgetNewestStroke();
}

void eraserMiss(benchmark::State &state)
{
    // Where nothing lies on the largest canvas, nothing lies on the others.
    static const auto places = boards().at(hugeCanvas)->emptyPlaces();
    Board &board = boardOf(state);
    board.choose(QStringLiteral("eraser"));
    board.press(places.front());
    board.show(); // what the other canvases' undo, which everybody hears of, has marked
    std::size_t next = 0;
    for (auto _ : state) {
        board.drag(places[next++ % places.size()]);
        board.show();
    }
}

void undoAndRedo(benchmark::State &state)
{
    Board &board = boardOf(state);
    board.choose(QStringLiteral("brush"));
    board.press(board.nextPoint());
    for (int left = penwick::bench::segmentsOfAStroke; left > 0; --left)
        board.drag(board.nextPoint());
    board.show();
    for (auto _ : state) {
        board.choose(QStringLiteral("undo"));
        board.show();
        board.choose(QStringLiteral("redo"));
        board.show();
    }
    board.forgetNewestStroke();
}

BENCHMARK(brushDrag)
    ->Arg(emptyCanvas)
    ->Arg(largeCanvas)
    ->Arg(hugeCanvas)
    ->UseManualTime()
    ->MinTime(0.2)
    ->Repetitions(repetitions)
    ->ReportAggregatesOnly()
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(eraserMiss)
    ->Arg(emptyCanvas)
    ->Arg(largeCanvas)
    ->Arg(hugeCanvas)
    ->MinTime(0.2)
    ->Repetitions(repetitions)
    ->ReportAggregatesOnly()
    ->Unit(benchmark::kMicrosecond);
// Both repaint the whole canvas: once is enough on the largest.
BENCHMARK(undoAndRedo)
    ->Arg(emptyCanvas)
    ->Arg(largeCanvas)
    ->Arg(hugeCanvas)
    ->Iterations(1)
    ->Repetitions(repetitions)
    ->ReportAggregatesOnly()
    ->Unit(benchmark::kMicrosecond);

void printMemory()
{
#ifdef PENWICK_HAS_MALLINFO2
    const auto inUse = [] {
        const struct mallinfo2 info = ::mallinfo2();
        return static_cast<double>(info.uordblks + info.hblkhd);
    };
    const double before = inUse();
    const auto model = std::make_shared<penwick::DrawingCanvasModel>();
    const auto history = std::make_shared<penwick::UndoRedoManager>();
    history->setDrawingCanvasModel(model);
    model->setUndoRedoManager(history);
    penwick::bench::scribble(*model, hugeCanvas);
    const double segments = static_cast<double>(hugeCanvas) * penwick::bench::segmentsOfAStroke;
    std::printf("Memory of a segment, its part of stroke and record included: %.1f bytes\n",
        (inUse() - before) / segments);
#else
    std::printf("Memory of a segment: not measured with this C library\n");
#endif
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    // In turn, so that a machine that grows slower does so for every canvas.
    std::string interleaving = "--benchmark_enable_random_interleaving=true";
    std::vector<char *> arguments(argv, argv + argc);
    arguments.insert(arguments.begin() + 1, interleaving.data());
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data()))
        return 1;
    penwick::setPenwickBundle(
        std::make_shared<penwick::platform::Bundle>(QStringLiteral(":/penwick/images")));
    for (const int strokes : { emptyCanvas, largeCanvas, hugeCanvas })
        boards()[strokes] = std::make_unique<Board>(strokes);

    penwick::bench::RatioTable table;
    benchmark::RunSpecifiedBenchmarks(&table);
    table.print();
    printMemory();
    boards().clear();
    return 0;
}
