// SPDX-License-Identifier: MIT
// A white board as a host opens it, and a pointer whose every event is carried through to what is
// painted.
#pragma once

#include "Pen.h"

#include <penwick/Penwick.h>
#include <penwick/platform/Geometry.h>

#include "content/CanvasContent.h"

#include <memory>

class QString;
class QWidget;

namespace penwick {

class DrawViewController;
class DrawingCanvasModel;
class DrawingCanvasView;

namespace bench {

/// A board whose canvas is 1280 by 720 points and holds scribbles of 40 segments, all painted.
///
/// Notifications are process-wide: while another board undoes, this one paints itself again too.
class Board
{
public:
    explicit Board(int strokes);
    ~Board();

    /// What the tool bar does: a drawing tool, or "clear", "undo", "redo".
    void choose(const QString &tool);

    /// The pointer comes over the canvas, which sets its cursor. The process has one cursor: of two
    /// boards that are measured in turn, each would otherwise set its own again at every event,
    /// which no real pointer makes them do.
    void takePointer();
    /// The pointer; nothing is painted before paintMarked().
    void press(platform::Point point);
    void drag(platform::Point point);

    /// Draws a stroke of 40 segments with `pen`, as the pointer would, and shows it.
    void draw(Pen &pen);

    /// Adds scribbles without a pointer, and shows them.
    void scribble(Pen &pen, int strokes, int segments = segmentsOfAStroke);

    /// Marks the whole canvas to be painted again.
    void expose();
    void resize(int width, int height);

    [[nodiscard]] DrawingCanvasModel &model() const;
    [[nodiscard]] const EntryList<StrokeEntry> &strokes() const;
    /// Pixels a point.
    [[nodiscard]] double scale() const;

private:
    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_window;
    DrawViewController *m_controller = nullptr;
    DrawingCanvasView *m_canvas = nullptr;
};

/// A press or, with the left button held, a move at `point`, counted upwards from the bottom left
/// corner of `widget`.
void sendPress(QWidget &widget, platform::Point point);
void sendDrag(QWidget &widget, platform::Point point);

/// Paints what is marked to be painted, and only that.
void paintMarked();

/// Does whatever else waits in the event loop, so that no measurement pays for it.
void settle();

} // namespace bench
} // namespace penwick
