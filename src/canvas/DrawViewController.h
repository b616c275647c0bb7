// SPDX-License-Identifier: MIT
// The controller of a canvas: tools, options, text boxes and the history reach the canvas by it.
#pragma once

#include "canvas/DrawingCanvasDelegate.h"
#include "canvas/ToolSelectionDelegate.h"
#include "history/SubviewOperation.h"
#include "platform/view/ImageView.h"
#include "platform/view/ViewController.h"
#include "textbox/TextBoxDelegate.h"

#include <penwick/platform/NotificationCenter.h>

#include <QPointer>

#include <memory>

namespace penwick {

namespace platform {
class Cursor;
class Window;
} // namespace platform

class UndoRedoManager;

/// Joins canvas, model, history and tool bar of one drawing window.
///
/// Canvas and model are there for the whole life of a loaded window; an operation that misses one
/// of them stops the process. Some names are misspelt, and are fixed so.
class DrawViewController final : public platform::ViewController,
                                 public DrawingCanvasDelegate,
                                 public ToolSelectionDelegate,
                                 public TextBoxDelegate
{
    Q_OBJECT

public:
    DrawViewController();
    ~DrawViewController() override;

    // What the loading of a scene connects. The two views are held weakly.
    void setDrawingView(DrawingCanvasView *view);
    [[nodiscard]] platform::ImageView *annotatedImageView() const { return m_annotatedImageView; }
    void setAnnotatedImageView(platform::ImageView *view) { m_annotatedImageView = view; }
    void setDrawingCanvasModel(std::shared_ptr<DrawingCanvasModel> model);
    /// A place in which others may keep the drawing window; the controller neither sets nor uses
    /// it. Weak.
    [[nodiscard]] platform::Window *drawingWindow() const;
    void setDrawingWindow(platform::Window *window);

    /// Shows `image` under the canvas.
    void configureAnnotatingImageView(const QImage &image);

    void viewDidLoad() override;

    /// Takes text box views off the canvas as the notification's object says; an object that is
    /// no subview operation stops the process.
    void handlDrawingCanvasSubviewOperation(const platform::Notification &notifiction);

    // DrawingCanvasDelegate
    void didBeginDrawing(platform::Point currentPoint) override;
    void drawPathOnCanvas(platform::Point pointToDraw, platform::Point lastPoint) override;
    void createTextBoxOnCanvas(platform::Point textBoxLocation) override;
    void didClearCanvas() override;
    void updateDrawingCanvasElements() override;
    void updateDrawingCanvasViewForDisplay() override;
    [[nodiscard]] const std::shared_ptr<DrawingCanvasModel> &drawingCanvasModel() const override;
    [[nodiscard]] DrawingCanvasView *drawingView() const override;

    // ToolSelectionDelegate
    Q_INVOKABLE void handleToolSelection(const QString &selectedTool) override;
    Q_INVOKABLE void handleToolOptionSelection(const QString &selectedToolOption) override;

    // TextBoxDelegate
    void shouldDeleteTheTextBox(std::int64_t withHash) override;

private:
    [[nodiscard]] DrawingCanvasView &canvas() const;
    [[nodiscard]] DrawingCanvasModel &model() const;
    [[nodiscard]] UndoRedoManager &history() const;
    void selectDrawingTool(const QString &tool, const QString &cursor);
    void setCursor(const platform::Cursor &cursor);
    void clearIfThereIsAnything();
    void removeSubviews(const SubviewOperation &operation);

    QPointer<DrawingCanvasView> m_drawingView;
    QPointer<platform::ImageView> m_annotatedImageView;
    std::shared_ptr<DrawingCanvasModel> m_drawingCanvasModel;
    QPointer<platform::Window> m_drawingWindow;
};

} // namespace penwick
