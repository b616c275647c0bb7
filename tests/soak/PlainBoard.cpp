// SPDX-License-Identifier: MIT
#include "soak/PlainBoard.h"

#include <utility>

namespace penwick::test {

const std::vector<std::string> &toolNames()
{
    static const std::vector<std::string> names { "text", "brush", "eraser", "color", "clear",
        "state", "redo", "undo" };
    return names;
}

const std::vector<std::string> &optionsOf(const std::string &kind)
{
    static const std::map<std::string, std::vector<std::string>> options {
        { "", {} },
        { "text", { "text#18", "text#24", "text#36", "text#48" } },
        { "color",
            { "color#black", "color#dark_grey", "color#light_grey", "color#red", "color#yellow",
                "color#green", "color#dark_blue", "color#light_blue", "color#white" } },
        { "brush", { "brush#3", "brush#5", "brush#8", "brush#12" } },
    };
    return options.at(kind);
}

PlainBoard::PlainBoard()
    : m_chosen { { "text", "text#24" }, { "color", "color#black" }, { "brush", "brush#5" } }
{
    for (const std::string &name : toolNames()) {
        m_isSelected[name] = name == "brush";
        m_isEnabled[name] = name != "undo" && name != "redo";
    }
    m_drawing.setListener([this](const std::string &notification) { hear(notification); });
    m_canvas.viewHidden = [this](const std::string &view) {
        if (view == m_held && !m_isReleasing)
            letGo();
    };
}

void PlainBoard::hear(const std::string &notification)
{
    m_posted.push_back(notification);
    if (notification == "redraw")
        m_canvas.copyContent();
    else if (notification.starts_with("removeWithId "))
        m_canvas.takeOff(notification.substr(13));
    else if (notification.starts_with("enableUndo"))
        m_isEnabled["undo"] = notification.ends_with("true");
    else if (notification.starts_with("enableRedo"))
        m_isEnabled["redo"] = notification.ends_with("true");
}

// The pointer

void PlainBoard::press(const std::string &target, Spot spot, int clickCount)
{
    m_held = target;
    const auto box = m_canvas.allBoxes.find(target);
    m_doLettersRest = box != m_canvas.allBoxes.end() && !box->second.isEditable;
    if (target == "canvas") {
        if (m_isKey) {
            orderPopoverOut();
            m_canvas.restoreTool();
        }
        m_canvas.press(spot);
    } else if (target.front() == 'b') {
        m_canvas.pressBox(target, spot, clickCount);
    } else {
        m_canvas.paint(); // a button shows at once that it is pressed, and its window with it
    }
}

void PlainBoard::drag(Spot spot)
{
    if (m_held == "canvas")
        m_canvas.drag(spot);
    else if (m_held.starts_with("b"))
        m_canvas.dragBox(m_held, spot);
}

void PlainBoard::release(Spot spot)
{
    const std::string target = m_held;
    m_isReleasing = true;
    if (target == "canvas")
        m_canvas.release(spot);
    else if (target.starts_with("b"))
        m_canvas.releaseBox(target, spot);
    else if (target.starts_with("x"))
        pressDeleteButton("b" + target.substr(1));
    m_isReleasing = false;
    letGo();
}

void PlainBoard::pressDeleteButton(const std::string &box)
{
    m_canvas.paint();
    m_canvas.pressDeleteButton(box);
}

void PlainBoard::letGo()
{
    m_held.clear();
    for (const auto &action : std::exchange(m_waiting, {}))
        action();
}

void PlainBoard::afterRelease(const std::function<void()> &action)
{
    if (isHeld())
        m_waiting.push_back(action);
    else
        action();
}

// The tool bar

void PlainBoard::click(const std::string &tool)
{
    if (m_isEnabled.at(tool))
        afterRelease([this, tool] { performTool(tool); });
}

void PlainBoard::choose(const std::string &option)
{
    afterRelease([this, option] { performOption(option); });
}

void PlainBoard::performTool(const std::string &tool)
{
    const std::string before = m_canvas.currentTool;
    m_isSelected.at(before) = false;
    m_isSelected.at(tool) = true;
    const bool isColorOpening = tool == "color" && !isPopoverVisible();
    showPopoverFor(tool, before);
    if (isColorOpening || tool == "clear" || tool == "undo" || tool == "redo") {
        m_isSelected.at(tool) = false;
        m_isSelected.at(before) = true;
    }
    if (tool == "state") {
        m_canvas.currentTool = "state";
        close();
    } else {
        m_canvas.chooseTool(tool);
    }
}

void PlainBoard::showPopoverFor(const std::string &tool, const std::string &toolBefore)
{
    const bool toggles
        = tool == "color" || ((tool == "text" || tool == "brush") && toolBefore == tool);
    if (toggles && !isPopoverVisible())
        showPopover(tool);
    else
        hidePopover();
}

void PlainBoard::pressPanel()
{
    pressBar();
    hidePopover();
    m_frames.letPanelGo();
}

void PlainBoard::showPopover(const std::string &kind)
{
    // A popover that is newly put into the window comes up only while the panel is on the screen.
    const bool isSame = m_popover == kind;
    m_popover = kind;
    if (isSame || m_isPanelVisible)
        m_isPopoverIn = true;
}

void PlainBoard::hidePopover()
{
    if (isPopoverVisible())
        orderPopoverOut();
}

void PlainBoard::performOption(const std::string &option)
{
    const auto hash = option.find('#');
    const std::string kind = option.substr(0, hash);
    m_chosen[kind] = option;
    m_canvas.chooseOption(kind, option.substr(hash + 1));
    orderPopoverOut();
}

// The window

void PlainBoard::turn()
{
    m_canvas.turn();
    if (m_isVisible && !m_isMinimised)
        m_canvas.paint();
}

void PlainBoard::moveTo(const PlainFrame &frame)
{
    orderPopoverOut();
    m_frames.moveTo(frame);
}

void PlainBoard::comeUpAt(const PlainFrame &frame)
{
    orderPopoverOut();
    m_frames.comeUpAt(frame);
}

void PlainBoard::rest(const PlainFrame &frame)
{
    m_frames.restAt(frame);
}

void PlainBoard::activate(bool isActive)
{
    if (m_isKey && !isActive)
        orderPopoverOut();
    m_isKey = isActive;
}

void PlainBoard::minimise(bool isMinimised)
{
    m_isMinimised = isMinimised;
    letGo(); // what is gone under the pointer hears of no release
    m_isPanelVisible = !isMinimised && !m_isClosed; // what stands above the board goes with it
}

void PlainBoard::hide()
{
    activate(false);
    letGo();
    m_isVisible = false;
    m_isPanelVisible = false;
}

void PlainBoard::show()
{
    m_isVisible = true;
    m_isPanelVisible = !m_isClosed;
    m_isKey = true;
    turn();
}

void PlainBoard::close()
{
    m_isPanelVisible = false;
    if (!std::exchange(m_isClosed, true))
        m_posted.emplace_back("end");
    if (m_isVisible)
        hide();
}

} // namespace penwick::test
