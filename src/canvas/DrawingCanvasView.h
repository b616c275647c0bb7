// SPDX-License-Identifier: MIT
// The surface that is drawn on.
#pragma once

#include "canvas/DrawingCanvasDelegate.h"
#include "canvas/ToolChooser.h"
#include "content/CanvasContent.h"
#include "platform/foundation/WeakReference.h"
#include "platform/view/ViewOf.h"
#include "strokes/StrokePicture.h"

#include <penwick/platform/Window.h>

#include <QColor>
#include <QPointer>
#include <QWidget>

#include <optional>

namespace penwick {

/// Turns the pointer into canvas operations, as the current tool says, and shows the strokes and
/// text boxes of its copies of the content. The content itself is the model's; the controller
/// copies it over after every change.
class DrawingCanvasView final : public platform::ViewOf<QWidget>
{
    Q_OBJECT

public:
    explicit DrawingCanvasView(QWidget *parent = nullptr);
    explicit DrawingCanvasView(const platform::Rect &frame);
    ~DrawingCanvasView() override;

    /// Where the brush was last dragged to or let go.
    [[nodiscard]] platform::Point lastPoint() const { return m_lastPoint; }
    void setLastPoint(platform::Point point) { m_lastPoint = point; }
    /// Where the brush was pressed, then where it was dragged to last.
    [[nodiscard]] platform::Point startPoint() const { return m_startPoint; }
    void setStartPoint(platform::Point point) { m_startPoint = point; }
    /// Whether the brush was dragged since it was let go last.
    [[nodiscard]] bool isDragged() const { return m_isDragged; }
    void setIsDragged(bool isDragged) { m_isDragged = isDragged; }

    [[nodiscard]] double brushThickness() const { return m_brushThickness; } ///< points
    void setBrushThickness(double thickness) { m_brushThickness = thickness; }
    [[nodiscard]] double textFontSize() const { return m_textFontSize; } ///< points
    void setTextFontSize(double size) { m_textFontSize = size; }
    /// Colour of new strokes, which are painted at alpha 0.7, and of new text boxes.
    [[nodiscard]] const QColor &brushColor() const { return m_brushColor; }
    void setBrushColor(const QColor &color) { m_brushColor = color; }

    /// Copies of the model's arrays, oldest first.
    [[nodiscard]] const EntryList<StrokeEntry> &pathArray() const { return m_pathArray; }
    void setPathArray(const EntryList<StrokeEntry> &strokes);
    [[nodiscard]] const EntryList<TextBoxEntry> &textBoxArray() const { return m_textBoxArray; }
    void setTextBoxArray(const EntryList<TextBoxEntry> &boxes);

    /// The tool that the pointer obeys. "brush", "eraser" and "text" do something.
    [[nodiscard]] const QString &currentSelectedTool() const { return m_currentSelectedTool; }
    void setCurrentSelectedTool(const QString &tool) { m_currentSelectedTool = tool; }
    /// The drawing tool chosen last. It is the current tool again after one that only acts once,
    /// such as undo. The spelling is fixed.
    [[nodiscard]] const QString &lastSelecedTool() const { return m_lastSelecedTool; }
    void setLastSelecedTool(const QString &tool);
    /// The cursor over the whole canvas.
    [[nodiscard]] const platform::Cursor &cursorType() const { return m_cursorType; }
    void setCursorType(const platform::Cursor &cursor) { m_cursorType = cursor; }

    /// A view that is kept for whoever sets it; the canvas neither shows nor asks it.
    [[nodiscard]] const std::shared_ptr<platform::View> &textBoxView() const
    {
        return m_textBoxView;
    }
    void setTextBoxView(std::shared_ptr<platform::View> view) { m_textBoxView = std::move(view); }

    /// Tells that nothing lies between the canvas and its window, so that it may paint the window's
    /// background itself, together with the strokes.
    void setCoversWindow(bool covers);

    /// Whether a text box here has the keys and takes what is typed.
    [[nodiscard]] bool isTextEdited() const;
    /// Whether `view` is a text box here that is not being edited.
    [[nodiscard]] bool hasPlacedTextBox(const platform::View &view) const;

    /// The window in which the tool bar shows its options; null where there is none. Weak.
    [[nodiscard]] platform::Window *popoverWindow() const { return m_popoverWindow; }
    void setPopoverWindow(platform::Window *window) { m_popoverWindow = window; }
    /// Chooses the eraser when the eraser end of a pen is put down, and the tool from before when
    /// the tip is put down next, unless another tool was chosen meanwhile. Without a chooser the
    /// controller chooses. Weak.
    void setToolChooser(ToolChooser *chooser) { m_toolChooser = chooser; }
    [[nodiscard]] DrawingCanvasDelegate *drawingCanvasDelegate() const;
    void setDrawingCanvasDelegate(DrawingCanvasDelegate *delegate);

    void mouseDown(const platform::MouseEvent &event) override;
    void mouseDragged(const platform::MouseEvent &event) override;
    void mouseUp(const platform::MouseEvent &event) override;
    [[nodiscard]] double dragDistance() const override;
    [[nodiscard]] bool takesPens() const override { return true; }
    void resetCursorRects() override;
    void draw(const platform::Rect &dirtyRect) override;
    /// The strokes; below them the window's background, if the canvas covers the window.
    void drawContent(QPainter &painter) override;

private:
    void followPenEnd(platform::PenEnd end);
    void chooseTool(const QString &tool);
    void beginStroke();
    void endStroke(platform::Point point);
    [[nodiscard]] bool isOver(platform::Point point) const;
    void dragTo(platform::Point point);
    void takePointer(platform::Point point);
    [[nodiscard]] bool dragEraserTo(platform::Point point);
    void eraseAt(platform::Point point);
    void placeTextBox(platform::Point point);
    [[nodiscard]] DrawingCanvasDelegate &controller() const;
    [[nodiscard]] DrawingCanvasModel &model() const;
    void dropEntryOfClick();
    void takeArraysAnew();
    void markHairline(const QRect &pixels);
    void bringBackTextBoxes();
    [[nodiscard]] QColor paper() const;
    [[nodiscard]] QSize pixelSize() const; // of the canvas
    const PixelLayer &finishedPixels();
    void showStrokes(const platform::Rect &dirtyRect);

    platform::Point m_lastPoint;
    platform::Point m_startPoint;
    bool m_isDragged = false;
    double m_brushThickness;
    EntryList<StrokeEntry> m_pathArray;
    StrokePicture m_picture; // of m_pathArray
    EntryList<TextBoxEntry> m_textBoxArray;
    double m_textFontSize;
    QColor m_brushColor;
    QString m_currentSelectedTool;
    QString m_lastSelecedTool;
    std::optional<platform::Point> m_eraserPlace; // where the eraser was last, while it is down
    QString m_toolBeforeEraserEnd; // empty: the pen has not chosen the eraser
    platform::WeakReference<ToolChooser> m_toolChooser;
    platform::Cursor m_cursorType = platform::Cursor::arrow();
    std::shared_ptr<platform::View> m_textBoxView;
    QPointer<platform::Window> m_popoverWindow;
    platform::WeakReference<DrawingCanvasDelegate> m_drawingCanvasDelegate;
    bool m_coversWindow = false;
    bool m_hasDroppedEntry = false; // m_pathArray lacks an entry, see dropEntryOfClick()
};

} // namespace penwick
