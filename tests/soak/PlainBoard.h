// SPDX-License-Identifier: MIT
// The second model as a whole: one drawing window with its tool bar, popovers and pointer.
#pragma once

#include "soak/PlainCanvas.h"
#include "soak/PlainFrames.h"

#include <functional>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

namespace penwick::test {

/// What a user and a host do to one drawing window, and what must come of it.
class PlainBoard
{
public:
    PlainBoard();
    PlainBoard(const PlainBoard &) = delete;
    PlainBoard &operator=(const PlainBoard &) = delete;

    /// The left button on the drawing window. `target`: canvas, b1, x1.
    void press(const std::string &target, Spot spot, int clickCount);
    void drag(Spot spot);
    void release(Spot spot);
    void pressWheelOn(const std::string &box) { m_canvas.pressWheelOn(box); }
    [[nodiscard]] bool isHeld() const { return !m_held.empty(); }

    void click(const std::string &tool); ///< its button, by whatever means
    /// The left button goes down on the tool bar or a popover.
    void pressBar() { m_doLettersRest = false; }
    void choose(const std::string &option); ///< its button: kind#value
    void pressPanel(); ///< its background
    /// By X-like names: letters, Return, BackSpace, 1 to 9, and C-z, C-y, C-Delete, C-w.
    void key(const std::string &name);

    // The box that is being edited, by keys that are its editor's, an input method or a drop
    void edit(const std::string &key);
    void compose(const std::string &half);
    void commit(const std::string &whole);
    void dropOn(const std::string &target, const std::string &dropped);
    void copyElsewhere(const std::string &text) { m_clipboard = text; }
    /// Takes over what a step has left to the editor, if the step may leave that.
    void adopt(const std::string &box, const std::string &now, const std::string &composed);
    void adoptFrame(const std::string &box, Spot corner, Spot boxSize, Spot canvasSize);
    void adoptSize(Spot canvasSize) { m_canvas.adoptSize(canvasSize); } ///< after the frames
    void adoptShown(std::size_t strokes) { m_canvas.adoptShown(strokes); }
    void adoptClipboard(const std::string &now);

    // The menu of a box; it may stay open while other things happen
    void openMenu(const std::string &box);
    void closeMenu() { m_menu.clear(); }
    void chooseFromMenu(const std::string &item); ///< by its action's name
    [[nodiscard]] std::string menu(); ///< whose is open; empty if none is

    // The user moves or pulls at the drawing window, and lets it rest
    void moveTo(const PlainFrame &frame);
    void resizeTo(const PlainFrame &frame)
    {
        m_frames.resizeTo(frame);
        m_canvas.hearResize();
    }
    /// It has come to rest, and the desktop has granted `frame` for the one that was asked for.
    void rest(const PlainFrame &frame);
    /// Where its windows came up.
    void setFrames(const PlainFrames &frames) { m_frames = frames; }
    [[nodiscard]] const PlainFrames &frames() const { return m_frames; }

    void comeUpAt(const PlainFrame &frame);

    void activate(bool isActive);
    void minimise(bool isMinimised);
    void hide();
    void show();
    void close();
    void showBanner(bool isShown) { m_isBannerShown = isShown; }
    void turn(); ///< the event loop has come round, and what is to be painted is

    [[nodiscard]] bool isClosed() const { return m_isClosed; }
    [[nodiscard]] bool isVisible() const { return m_isVisible; }
    [[nodiscard]] bool isMinimised() const { return m_isMinimised; }
    [[nodiscard]] bool isKey() const { return m_isKey; }
    [[nodiscard]] bool isBannerVisible() const
    {
        return m_isBannerShown && m_isVisible && !m_isMinimised;
    }
    [[nodiscard]] bool isPopoverVisible() const { return m_isPopoverIn && m_isPanelVisible; }
    [[nodiscard]] std::string popover() const { return m_popover; } ///< kind; empty before any
    [[nodiscard]] const PlainCanvas &canvas() const { return m_canvas; }

    /// All that can be seen, as lines of text; what was posted since the last time is the last.
    [[nodiscard]] std::string inWords();

private:
    void hear(const std::string &notification);
    void afterRelease(const std::function<void()> &action);
    void pressDeleteButton(const std::string &box);
    void letGo();
    void performTool(const std::string &tool);
    void performOption(const std::string &option);
    void showPopoverFor(const std::string &tool, const std::string &toolBefore);
    void showPopover(const std::string &kind);
    void hidePopover();
    void orderPopoverOut() { m_isPopoverIn = false; }
    void boxKey(const std::string &box, const std::string &name);
    void windowKey(const std::string &name);
    void editIn(const std::string &box, const std::string &key);

    PlainDrawing m_drawing;
    PlainCanvas m_canvas { m_drawing };
    std::vector<std::string> m_posted;

    std::map<std::string, bool> m_isSelected; // tool buttons
    std::map<std::string, bool> m_isEnabled;
    std::map<std::string, std::string> m_chosen; // option of each kind
    std::string m_popover;
    bool m_isPopoverIn = false; // asked to the screen
    bool m_isPanelVisible = true;
    bool m_isVisible = true;
    bool m_isMinimised = false;
    bool m_isKey = true;
    bool m_isClosed = false;
    bool m_isBannerShown = false;
    bool m_doLettersRest = false; // letters and digits, which otherwise work the tool bar
    PlainFrames m_frames;

    std::string m_menu; // of this box
    bool m_isMenuOfResponder = false; // it had the keys
    std::string m_clipboard;
    std::optional<std::string> m_copiedFrom; // the whole text, until it is known what was copied
    std::string m_copied; // the box whose text that is
    bool m_isCut = false;

    std::string m_held; // what the left button is held down on
    bool m_isReleasing = false;
    std::vector<std::function<void()>> m_waiting; // until it is let go
};

/// The option buttons of a popover, in their order.
[[nodiscard]] const std::vector<std::string> &optionsOf(const std::string &kind);
[[nodiscard]] const std::vector<std::string> &toolNames();
/// `text` with a stroke for every end of a line.
[[nodiscard]] std::string inOneLine(std::string text);

} // namespace penwick::test
