// SPDX-License-Identifier: MIT
// The component itself, opened as a host opens it and worked by events without a screen.
#pragma once

#include "soak/PlainDrawing.h"
#include "soak/PlainFrames.h"
#include "support/NotificationRecorder.h"

#include <penwick/Penwick.h>

#include <QEvent>
#include <QPointF>
#include <QRect>

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

class QWidget;
class QWindow;

class QAbstractButton;

namespace penwick {

class DrawViewController;
class DrawingCanvasView;
class TnTextBox;
class ToolPanelViewController;

namespace platform {
class Button;
class View;
} // namespace platform

namespace test {

/// One session of a host: its entry object and the drawing window that it opened last.
///
/// Pointer and keys go through the toolkit's own delivery, at times of a clock that stands still
/// unless a step is taken. Nothing waits for a timer: a step calls by name what a timer would do.
class RealBoard
{
public:
    RealBoard();
    ~RealBoard();
    RealBoard(const RealBoard &) = delete;
    RealBoard &operator=(const RealBoard &) = delete;

    /// Opens a drawing window as the host's (only) one, in the place of one that is still open.
    void open(WindowType type = WindowType::whiteboard);

    /// What a pointer at `spot` points at: canvas, b1, x1.
    [[nodiscard]] std::string targetAt(Spot spot) const;
    [[nodiscard]] Spot size() const; ///< of the canvas
    [[nodiscard]] std::size_t shownStrokes() const;
    [[nodiscard]] QPointF onDesktop(Spot spot) const;
    /// A box's top left corner and its size.
    [[nodiscard]] bool isOnCanvas(const std::string &box) const;
    [[nodiscard]] Spot cornerOf(const std::string &box) const;
    [[nodiscard]] Spot sizeOf(const std::string &box) const;
    /// The middle of what can be seen of a box or a delete button; the canvas's if nothing can.
    [[nodiscard]] Spot middleOf(const std::string &view) const;

    void press(Spot spot, Qt::MouseButton button = Qt::LeftButton);
    void pressAgain(Spot spot); ///< soon enough to be a double click
    void move(Spot spot);
    void release(Spot spot, Qt::MouseButton button = Qt::LeftButton);
    [[nodiscard]] Qt::MouseButtons held() const { return m_held; }
    void clickTool(const std::string &name, bool byPointer);
    void pressToolElsewhere(const std::string &name); ///< let go beside it
    void chooseOption(const std::string &name, bool byPointer);
    void pressPanel(); ///< its background
    void key(const std::string &name);

    // What reaches a box otherwise than by the pointer
    void compose(const std::string &half); ///< by an input method
    void commit(const std::string &whole); ///< instead of what it composed
    /// Another application's text (nothing: its picture) is dragged over a place, as long as it is
    /// neither dropped nor taken back. Answers whether it could be dropped there.
    bool dragOver(Spot spot, const std::string &text);
    void drop(Spot spot, const std::string &text);
    void dragAway();
    static void copyElsewhere(const std::string &text); ///< in another application
    [[nodiscard]] static std::string clipboard();

    // The menu of a box, which a press with the right button opens too
    void openMenuByKey();
    [[nodiscard]] std::string menu() const; ///< whose is open; empty if none is
    [[nodiscard]] static std::vector<std::string> menuItems(); ///< what can be chosen, by name
    void chooseFromMenu(const std::string &item, bool byPointer);
    /// Whether nothing, not even a menu, covers the board there.
    [[nodiscard]] bool isBoardAt(Spot spot) const;

    /// A box's text, and what is half composed in it; nothing if it is not on the canvas.
    [[nodiscard]] std::string textOf(const std::string &box) const;
    [[nodiscard]] std::string composedIn(const std::string &box) const;

    [[nodiscard]] QRect outerFrame() const; ///< of the desktop's, y down
    void moveTo(const QRect &outer); ///< by the user, or pulled to it
    void rest(); ///< the user has let go of it
    [[nodiscard]] PlainFrames frames() const;

    void activate(bool isActive);
    void minimise(bool isMinimised);
    void hide();
    void show();
    void close();
    void showBanner(bool isShown);
    /// The event loop comes round, and what is to be painted is.
    void turn();

    /// All that can be seen, in the words of the second model.
    [[nodiscard]] std::string inWords();

private:
    [[nodiscard]] DrawViewController &controller() const;
    [[nodiscard]] DrawingCanvasView &canvas() const;
    [[nodiscard]] ToolPanelViewController &bar() const;
    [[nodiscard]] platform::Window &window() const;
    [[nodiscard]] platform::Button &option(const std::string &name) const;
    [[nodiscard]] std::string nameOf(std::int64_t id) const;
    [[nodiscard]] std::string nameOf(platform::View *view) const;
    [[nodiscard]] std::string inWords(const std::string &posted) const;
    [[nodiscard]] std::string viewsInWords() const;
    [[nodiscard]] std::string panelInWords() const;
    [[nodiscard]] QPointF inWindow(Spot spot) const;
    [[nodiscard]] const TnTextBox *boxCalled(const std::string &name) const;
    void paint();
    void hearDesktop(); ///< the desktop's answers, and what is done about them at once
    void learnNames();
    void send(QWindow &window, QPointF place, Qt::MouseButton button, QEvent::Type type);
    void click(QAbstractButton &button, bool byPointer);
    void sendTo(QWidget &widget, QPointF place, Qt::MouseButton button, QEvent::Type type);

    std::unique_ptr<Penwick> m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
    std::unique_ptr<NotificationRecorder> m_recorder;
    std::map<std::int64_t, std::string> m_names; // of strokes and boxes, by identifier
    std::map<const void *, std::string> m_deleteButtons;
    int m_strokes = 0;
    int m_boxes = 0;
    Qt::MouseButtons m_held;
    int m_time = 0; // ms
    bool m_isDraggedOver = false;
};

} // namespace test
} // namespace penwick
