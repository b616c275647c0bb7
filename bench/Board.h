// SPDX-License-Identifier: MIT
// A canvas with many strokes in a window, and a pointer whose every event is carried through to
// what is painted.
#pragma once

#include <penwick/platform/Geometry.h>
#include <penwick/platform/Window.h>

#include <QEvent>

#include <memory>
#include <random>
#include <vector>

class QString;

namespace penwick {

class DrawViewController;
class DrawingCanvasModel;
class DrawingCanvasView;
class UndoRedoManager;

namespace bench {

constexpr int segmentsOfAStroke = 40;

/// Draws `strokes` scribbles of 40 segments into `model`; the first ones are the same for every
/// number.
void scribble(DrawingCanvasModel &model, int strokes);

/// A window of 1280 by 720 whose canvas holds a number of scribbles, all of them painted.
class Board
{
public:
    explicit Board(int strokes);
    ~Board();

    void choose(const QString &tool);

    /// The pointer; nothing is painted before show().
    void press(platform::Point point);
    void drag(platform::Point point);

    /// Paints what is marked to be painted, and only that.
    void show();

    /// Takes the newest stroke back without painting anything.
    void forgetNewestStroke();

    /// Where the next segment of a scribble may lead.
    [[nodiscard]] platform::Point nextPoint();

    /// Places on which no stroke lies.
    [[nodiscard]] std::vector<platform::Point> emptyPlaces() const;

private:
    void send(QEvent::Type type, platform::Point point);

    platform::Window m_window;
    DrawingCanvasView *m_canvas = nullptr;
    DrawViewController *m_controller = nullptr;
    std::unique_ptr<DrawingCanvasView> m_notShown;
    std::mt19937 m_random { 1 };
    platform::Point m_point { 300.0, 300.0 };
};

} // namespace bench
} // namespace penwick
