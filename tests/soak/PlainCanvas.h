// SPDX-License-Identifier: MIT
// The second model's canvas: what a pointer on it does with each tool, and its text boxes.
#pragma once

#include "soak/PlainDrawing.h"
#include "soak/PlainText.h"

#include <functional>
#include <map>
#include <string>
#include <vector>

namespace penwick::test {

/// A text box as far as it can be told without fonts.
struct PlainBox
{
    bool isEditable = true;
    bool hasDashedBorder = true;
    bool isDeleted = false;
    bool isOnCanvas = false;
    bool isButtonShown = false;
    PlainText text;
    double x = 0.0;
    double top = 0.0;
    Spot size { 200, 30 }; ///< depends on fonts, so it is taken over
};

/// The canvas view, its controller and the text boxes, as one plain machine.
class PlainCanvas
{
public:
    explicit PlainCanvas(PlainDrawing &drawing)
        : m_drawing(drawing)
    { }

    // The pointer, on the canvas itself or on the box called `name`
    void press(Spot spot);
    void drag(Spot spot);
    void release(Spot spot);
    void pressBox(const std::string &name, Spot spot, int clickCount);
    void dragBox(const std::string &name, Spot spot);
    void releaseBox(const std::string &name, Spot spot);
    void pressWheelOn(const std::string &name) { allBoxes.at(name).text.commit(); }
    void pressDeleteButton(const std::string &name) { removeAndReport(name); }

    // Keys
    [[nodiscard]] std::string editedBox() const; ///< empty if none is being edited
    [[nodiscard]] std::string responder() const { return m_responder; }
    void type(const std::string &letter); ///< at the end of the edited box
    void backspace(); ///< pressed and let go, at the end of the text
    void releaseBackspace(); ///< let go; the press was the editor's
    void endEditing() { makeFirstResponder("canvas"); }

    /// Where a box really stands, on a canvas of that size. Its own size is taken over; its place
    /// if what was written in it, or a window that was resized, may have moved it there.
    void adoptFrame(const std::string &name, Spot corner, Spot boxSize, Spot canvasSize);
    void hearResize() { m_wasResized = true; } ///< though it may have its size again
    void adoptSize(Spot canvasSize) ///< after the frames
    {
        m_size = canvasSize;
        m_wasResized = false;
    }

    // What the tool bar asks for; "state" is not the canvas's
    void chooseTool(const std::string &tool);
    void chooseOption(const std::string &kind, const std::string &value);

    // What the history asks for
    void takeOff(const std::string &box);
    void copyContent();

    /// It is painted: boxes that came back appear, edited ones show their button.
    void paint();
    /// The event loop has come round.
    void turn();
    /// How many strokes are shown: what was painted may have been a box alone, or all of it.
    void adoptShown(std::size_t count);
    void restoreTool() { currentTool = lastTool; }

    std::string currentTool = "brush";
    std::string lastTool = "brush";
    std::string color = "black";
    std::string thickness = "5";
    std::string fontSize = "24";
    std::vector<std::string> strokes; ///< the view's own copies
    std::vector<std::string> boxes;
    std::vector<std::string> views; ///< on the canvas: b1 a box, x1 its delete button
    std::map<std::string, PlainBox> allBoxes; ///< that ever were
    /// Is told of a view that is not to be seen any more.
    std::function<void(const std::string &view)> viewHidden;

private:
    void makeFirstResponder(const std::string &who);
    void resign(const std::string &name);
    void leave(const std::string &name);
    void removeAndReport(const std::string &name);
    void report(const std::string &name);
    void putOn(const std::string &name);
    void showButton(const std::string &name);
    void placeBox(Spot spot);
    void erase(Spot spot);
    void eraseUpTo(Spot spot);
    void clear();
    [[nodiscard]] bool isOnCanvas(const std::string &view) const;
    void bringIntoReach(PlainBox &box) const;

    PlainDrawing &m_drawing;
    std::string m_responder; // empty: the window itself
    Spot m_start;
    Spot m_pressedAt; // on the canvas
    Spot m_cameFrom; // the eraser
    bool m_isFar = false; // the pointer has been so far from its press that this is no click
    bool m_isDragged = false;
    bool m_hasDropped = false;
    bool m_isPainted = false; // some of the canvas, since adoptShown()
    bool m_canPan = false; // the box that is held down can be dragged
    bool m_isPanning = false;
    Spot m_pressed;
    Spot m_size; // of the canvas
    bool m_wasResized = false; // since m_size was taken over
    Spot m_grabbed; // the box's place when it was pressed
};

} // namespace penwick::test
