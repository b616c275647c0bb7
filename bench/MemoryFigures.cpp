// SPDX-License-Identifier: MIT
// What strokes, their history and the finished pixels take of the memory.
#include "Board.h"
#include "Figure.h"

#include "canvas/DrawingCanvasModel.h"
#include "history/UndoRedoManager.h"
#include "strokes/StrokeIndex.h"
#include "strokes/StrokePicture.h"

#include <penwick/platform/BezierPath.h>

#include <QString>

#include <set>
#include <variant>

#ifdef PENWICK_HAS_MALLINFO2
#include <malloc.h>
#endif

namespace penwick::bench {

namespace {

constexpr int manyStrokes = 10'000;

#ifdef PENWICK_HAS_MALLINFO2

double bytesInUse()
{
    const struct mallinfo2 info = ::mallinfo2();
    return static_cast<double>(info.uordblks + info.hblkhd);
}

/// What a stroke takes on a board all told: points, entry, record, index.
double bytesOfAStroke(int segments)
{
    Board board(1); // so that everything is there which is there once
    Pen pen(13);
    const double before = bytesInUse();
    board.scribble(pen, manyStrokes, segments);
    static_cast<void>(board.model().strokeIndex().touching({})); // so that it has taken them in
    return (bytesInUse() - before) / manyStrokes;
}

/// What the finished pixels of `strokes` take, the index left out, in windows full of pixels.
double windowsCached(const EntryList<StrokeEntry> &strokes, double scale)
{
    const QSize size = QSize(canvasWidth, canvasHeight) * scale;
    StrokeIndex index;
    index.follow(strokes);
    static_cast<void>(index.touching({})); // so that it has taken them in
    const double before = bytesInUse();
    StrokePicture picture;
    picture.follow(strokes);
    picture.update(index, size, scale);
    return (bytesInUse() - before) / (4.0 * size.width() * size.height());
}

Figures byteFigures()
{
    Board board(manyStrokes);
    const EntryList<StrokeEntry> &all = board.strokes();
    EntryList<StrokeEntry> one;
    one.append(all.first());
    return {
        { "6 a segment all told, in strokes of 40", "bytes",
            bytesOfAStroke(segmentsOfAStroke) / segmentsOfAStroke, std::nullopt,
            { 48.0, std::nullopt } },
        { "6 a stroke beside its segments", "bytes", bytesOfAStroke(0), std::nullopt,
            { 512.0, std::nullopt } },
        { "6 cached pixels in windows: 10,000 strokes against one", "",
            windowsCached(all, board.scale()), windowsCached(one, board.scale()),
            { std::nullopt, 1.05 } },
    };
}

#else

Figures byteFigures()
{
    return {}; // not measured with this C library
}

#endif

std::set<const platform::BezierPath *> pathsOf(const EntryList<StrokeEntry> &strokes)
{
    std::set<const platform::BezierPath *> paths;
    for (const StrokeEntry &entry : strokes)
        paths.insert(entry.bPath.get());
    return paths;
}

Figure sharingFigure()
{
    Board board(manyStrokes);
    const auto paths = pathsOf(board.strokes());
    board.choose(QStringLiteral("clear"));
    double copied = 0.0;
    for (const UndoRedoState &record : board.model().undoRedoManager()->undoStack())
        copied += paths.count(std::get<StrokeEntry>(record.element).bPath.get()) ? 0.0 : 1.0;
    return { "6 strokes that the history of a clear of 10,000 has copied", "", copied, std::nullopt,
        { 0.0, std::nullopt } };
}

} // namespace

Figures memoryFigures()
{
    Figures figures = byteFigures();
    figures.push_back(sharingFigure());
    return figures;
}

} // namespace penwick::bench
