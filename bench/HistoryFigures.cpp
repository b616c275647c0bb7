// SPDX-License-Identifier: MIT
// What taking back, bringing back and erasing one stroke costs, and bringing back all of them.
#include "Board.h"
#include "Figure.h"
#include "Turns.h"

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"
#include "strokes/StrokePainter.h"

#include <penwick/platform/BezierPath.h>

#include <QString>

#include <random>
#include <utility>

namespace penwick::bench {

namespace {

constexpr int manyStrokes = 10'000;
constexpr int rounds = 12;
constexpr int stepsOfARound = 5; // as many as the tool bar offers
constexpr int clears = 7;
constexpr double fastHand = 32.0; // points from one event to the next

// One frame is the target at scale 1. At larger scales the figure is printed without a target.
Target oneFrame(const Board &board)
{
    constexpr double frame = 8'000.0; // us
    return board.scale() == 1.0 ? Target { frame, std::nullopt } : Target {};
}

/// The times of one kind of event, over several rounds of them.
class Steps
{
public:
    explicit Steps(Turns::Event event) { m_turns.add(std::move(event)); }

    void take() { m_turns.take(stepsOfARound); }
    [[nodiscard]] const Samples &samples() const { return m_turns.of(0); }

private:
    Turns m_turns;
};

/// The eraser, by drags of a given length. Each has a press of its own, somewhere on a stroke: the
/// way from the drag before would be as long as the board, and erase all that it crosses.
class Erasures
{
public:
    Erasures(Board &board, double length)
    {
        m_turns.add(
            [this, &board, length](int) {
                board.drag({ m_start.x + length, m_start.y });
                paintMarked();
            },
            [this, &board] {
                const auto &strokes = board.strokes();
                const auto index = m_random() % static_cast<unsigned>(strokes.size());
                m_start = strokes[static_cast<int>(index)].bPath->chain()[segmentsOfAStroke / 2];
                board.press(m_start);
            });
    }

    void take() { m_turns.take(stepsOfARound); }
    [[nodiscard]] const Samples &samples() const { return m_turns.of(0); }

private:
    std::mt19937 m_random { 9 };
    platform::Point m_start;
    Turns m_turns;
};

Figures stepFigures(Board &board)
{
    Pen pen(5);
    const auto choosing = [&board](const QString &tool) {
        return [&board, tool](int) {
            board.choose(tool);
            paintMarked();
        };
    };
    Steps undos(choosing(QStringLiteral("undo")));
    Steps redos(choosing(QStringLiteral("redo")));
    Steps undosOfErase(choosing(QStringLiteral("undo")));
    Erasures erasures(board, 0.0);
    Erasures sweeps(board, fastHand);
    for (int round = 0; round < rounds; ++round) {
        for (int stroke = 0; stroke < stepsOfARound; ++stroke)
            board.draw(pen);
        undos.take();
        redos.take();
        board.choose(QStringLiteral("eraser"));
        erasures.take();
        undosOfErase.take();
        sweeps.take();
    }
    return {
        timeOf("4 undo of one stroke at 10,000", undos.samples(), oneFrame(board)),
        timeOf("4 redo of one stroke at 10,000", redos.samples(), oneFrame(board)),
        timeOf("3, 4 erasure of one stroke at 10,000", erasures.samples(), oneFrame(board)),
        timeOf("3, 4 drag of the eraser by 32 points through 10,000", sweeps.samples(),
            oneFrame(board)),
        timeOf("4 undo of an erasure at 10,000", undosOfErase.samples(), oneFrame(board)),
    };
}

Figure clearFigure(Board &board)
{
    CoverageMask scratch;
    EntryList<StrokeEntry> strokes;
    Turns turns;
    const auto undo = turns.add([&board](int) {
        board.choose(QStringLiteral("undo"));
        paintMarked();
    });
    const auto painting = turns.add([&](int) {
        PixelLayer layer(QSize(canvasWidth, canvasHeight) * board.scale());
        for (int index = 0; index < strokes.size(); ++index) {
            paintStroke(layer, strokes[index], colorOf(strokes, index), board.scale(), layer.area(),
                scratch);
        }
    });
    for (int clear = 0; clear < clears; ++clear) {
        strokes = board.strokes();
        board.choose(QStringLiteral("clear"));
        settle();
        turns.take(1);
    }
    return timeOf("4 undo of a clear of 10,000 strokes against painting them once", turns.of(undo),
        turns.of(painting), { std::nullopt, 1.3 });
}

} // namespace

Figures historyFigures()
{
    Board board(manyStrokes);
    Figures figures = stepFigures(board);
    figures.push_back(clearFigure(board));
    return figures;
}

} // namespace penwick::bench
