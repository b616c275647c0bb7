// SPDX-License-Identifier: MIT
// What a canvas asks of its controller.
#pragma once

#include <penwick/platform/Geometry.h>

#include <memory>

namespace penwick {

class DrawingCanvasModel;
class DrawingCanvasView;

/// The controller of a canvas, as the canvas sees it. Implemented by a QObject that is the
/// TextBoxDelegate of the canvas's text boxes too. Points are in the canvas's coordinates.
class DrawingCanvasDelegate
{
public:
    virtual ~DrawingCanvasDelegate() = default;

    /// The stroke being drawn has reached `currentPoint`.
    virtual void didBeginDrawing(platform::Point currentPoint) = 0;
    /// Shows the newest stroke's segment from `lastPoint` to `pointToDraw`.
    virtual void drawPathOnCanvas(platform::Point pointToDraw, platform::Point lastPoint) = 0;
    /// Shows the newest text box, which was placed at `textBoxLocation`.
    virtual void createTextBoxOnCanvas(platform::Point textBoxLocation) = 0;
    /// Empties the canvas.
    virtual void didClearCanvas() = 0;
    /// Hands the model's arrays to the canvas.
    virtual void updateDrawingCanvasElements() = 0;
    /// The same, and paints the canvas again.
    virtual void updateDrawingCanvasViewForDisplay() = 0;
    /// The content; null before it was made.
    [[nodiscard]] virtual const std::shared_ptr<DrawingCanvasModel> &drawingCanvasModel() const = 0;
    /// The canvas itself; null once it is gone.
    [[nodiscard]] virtual DrawingCanvasView *drawingView() const = 0;
};

} // namespace penwick
