// SPDX-License-Identifier: MIT
// What the eraser costs where nothing lies and where something does, and what it paints again.
#include "Board.h"
#include "Figure.h"
#include "Turns.h"

#include "strokes/StrokeIndex.h"
#include "strokes/StrokePainter.h"
#include "strokes/StrokePicture.h"

#include <QString>

#include <algorithm>

namespace penwick::bench {

namespace {

constexpr int manyStrokes = 10'000;
constexpr int eventsAtOnce = 64;
constexpr int rounds = 400;

Figure missFigure()
{
    Board full(manyStrokes);
    Board empty(0);
    const auto places = freePlaces();
    std::size_t turn = 0;
    const auto placeOfTurn = [&] { return places[turn % places.size()]; };
    const auto missOn = [&placeOfTurn](Board &board) {
        return [&placeOfTurn, &board](int) {
            for (int event = 0; event < eventsAtOnce; ++event) {
                board.drag(around(placeOfTurn(), event));
                paintMarked();
            }
        };
    };
    // The way from one place to the next would come upon strokes, so each has a press of its own.
    const auto goOn = [&](Board &board) {
        return [&turn, &placeOfTurn, &board] {
            ++turn;
            board.takePointer();
            board.press(around(placeOfTurn(), 0));
        };
    };
    Turns turns;
    const auto onFull = turns.add(missOn(full), goOn(full), eventsAtOnce);
    const auto onEmpty = turns.add(missOn(empty), goOn(empty), eventsAtOnce);
    for (Board *const board : { &full, &empty }) {
        board->choose(QStringLiteral("eraser"));
    }
    settle();
    turns.take(rounds);
    return timeOf("3 eraser where nothing lies: 10,000 strokes against none", turns.of(onFull),
        turns.of(onEmpty), { 5.0, 3.0 });
}

/// How many pixels of a picture are written when the stroke at `gone` is removed. Before that all
/// pixels are given a colour that no stroke has; those that have lost it were written.
double pixelsPaintedWithout(const Board &board, int gone, const QRect &area)
{
    const QSize size = QSize(canvasWidth, canvasHeight) * board.scale();
    StrokeIndex index;
    StrokePicture picture;
    const auto show = [&](const EntryList<StrokeEntry> &strokes) {
        index.follow(strokes);
        picture.follow(strokes);
        picture.update(index, size, board.scale());
    };
    show(board.strokes());
    constexpr QRgb untouched = 0x01010101;
    const QImage &image = picture.pixels().image();
    // The picture lets nobody write to its pixels. As nobody else shares the image, its lines can
    // be written past the picture.
    for (int y = 0; y < image.height(); ++y) {
        auto *const line = reinterpret_cast<QRgb *>(const_cast<uchar *>(image.constScanLine(y)));
        std::fill_n(line, image.width(), untouched);
    }
    EntryList<StrokeEntry> without = board.strokes();
    without.removeAt(gone);
    show(without);

    double painted = 0.0;
    for (int y = 0; y < image.height(); ++y) {
        const auto *const line = reinterpret_cast<const QRgb *>(image.constScanLine(y));
        painted += static_cast<double>(
            image.width() - std::count(line, line + image.width(), untouched));
    }
    return painted / (static_cast<double>(area.width()) * area.height());
}

Figure paintedFigure()
{
    const Board board(manyStrokes);
    const int index = manyStrokes / 2;
    const QRect area = pixelsOf(board.strokes()[index], board.scale());
    return { "3 pixels painted again by an erasure, in the stroke's rectangles", "",
        pixelsPaintedWithout(board, index, area), std::nullopt, { 1.0, std::nullopt } };
}

} // namespace

Figures eraserFigures()
{
    return { missFigure(), paintedFigure() };
}

} // namespace penwick::bench
