// SPDX-License-Identifier: MIT
// What opening a white board costs, once the process has opened one.
#include "Board.h"
#include "Figure.h"

#include "canvas/DrawingCanvasView.h"

#include <penwick/Penwick.h>

#include <QCoreApplication>
#include <QEvent>
#include <QGuiApplication>

namespace penwick::bench {

namespace {

constexpr int warmUps = 2;
constexpr int openings = 15;

/// Sees when a canvas has been painted.
class PaintWatch final : public QObject
{
public:
    PaintWatch() { QCoreApplication::instance()->installEventFilter(this); }

    [[nodiscard]] bool hasSeenPaint() const { return m_hasSeenPaint; }

    bool eventFilter(QObject *object, QEvent *event) override
    {
        if (event->type() == QEvent::Paint && qobject_cast<DrawingCanvasView *>(object))
            m_hasSeenPaint = true;
        return false;
    }

private:
    bool m_hasSeenPaint = false;
};

Time openAndClose()
{
    const PaintWatch paint;
    Penwick penwick;
    const Stopwatch watch;
    const auto controller = penwick.createDrawingWindowController(
        WindowType::whiteboard, QGuiApplication::primaryScreen());
    controller->showWindow(nullptr);
    while (!paint.hasSeenPaint())
        QCoreApplication::processEvents();
    return watch.elapsed();
}

} // namespace

Figures openingFigures()
{
    Samples samples;
    for (int opening = 0; opening < warmUps + openings; ++opening) {
        const Time time = openAndClose();
        settle();
        if (opening >= warmUps)
            samples.add(time);
    }
    return { timeOf("8 opening a white board, to its first painted frame", samples,
        { 50'000.0, std::nullopt }) };
}

} // namespace penwick::bench
