// SPDX-License-Identifier: MIT
// What painting a window costs whose content has not changed.
#include "Board.h"
#include "Figure.h"
#include "Turns.h"

#include <QImage>

#include <cstring>

namespace penwick::bench {

namespace {

constexpr int manyStrokes = 10'000;
constexpr int exposes = 300;
constexpr int resizeSteps = 120;

/// Two pictures of a window's size, the one to be copied into the other.
class PlainCopy
{
public:
    explicit PlainCopy(double scale)
        : m_from(QSize(canvasWidth, canvasHeight) * scale, QImage::Format_ARGB32_Premultiplied)
        , m_to(m_from.size(), m_from.format())
    {
        m_from.fill(Qt::white);
        m_to.fill(Qt::black);
    }

    void copy()
    {
        std::memcpy(
            m_to.bits(), m_from.constBits(), static_cast<std::size_t>(m_from.sizeInBytes()));
    }

private:
    QImage m_from;
    QImage m_to;
};

/// Sizes as a hand drags a corner out and back again: up to a tenth more than the canvas.
QSize sizeAt(int step)
{
    constexpr int there = 32; // steps
    const int outwards = there - std::abs(step % (2 * there) - there);
    return { canvasWidth + 4 * outwards, canvasHeight + 2 * outwards };
}

} // namespace

Figures windowFigures()
{
    Board board(manyStrokes);
    PlainCopy pixels(board.scale());
    const auto copying = [&pixels](int) { pixels.copy(); };
    Turns exposing;
    const auto expose = exposing.add([&board](int) {
        board.expose();
        paintMarked();
    });
    const auto copyBesideExpose = exposing.add(copying);
    exposing.take(exposes);

    Turns resizing;
    const auto resize = resizing.add([&board](int step) {
        const QSize size = sizeAt(step + 1);
        board.resize(size.width(), size.height());
        settle();
    });
    const auto copyBesideResize = resizing.add(copying);
    resizing.take(resizeSteps);

    const Target threeTimes { std::nullopt, 3.0 };
    return {
        timeOf("5 expose of the whole window against a copy of its pixels", exposing.of(expose),
            exposing.of(copyBesideExpose), threeTimes),
        timeOf("5 step of a resize against a copy of the window's pixels", resizing.of(resize),
            resizing.of(copyBesideResize), threeTimes),
    };
}

} // namespace penwick::bench
