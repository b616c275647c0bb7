// SPDX-License-Identifier: MIT
// The second model's keys, and what the editor of a box does with them and with its menu.
#include "soak/PlainBoard.h"

#include <utility>

namespace penwick::test {

void PlainBoard::key(const std::string &name)
{
    const std::string responder = m_canvas.responder();
    if (m_canvas.allBoxes.count(responder))
        boxKey(responder, name);
    else
        windowKey(name);
}

void PlainBoard::boxKey(const std::string &box, const std::string &name)
{
    const bool isEditable = m_canvas.allBoxes.at(box).isEditable;
    PlainText &text = m_canvas.allBoxes.at(box).text;
    m_doLettersRest |= isEditable;
    if (name == "Escape" && !text.composed().empty()) {
        text.commit();
    } else if (name == "Return" || name == "Tab" || name == "Escape") {
        m_canvas.endEditing();
    } else if (name == "BackSpace" || name == "Delete") {
        if (!isEditable)
            windowKey(name);
        m_canvas.backspace();
    } else if (isEditable && name.size() == 1) {
        m_canvas.type(name);
    } else if (!isEditable) {
        windowKey(name);
    }
}

void PlainBoard::windowKey(const std::string &name)
{
    static const std::map<std::string, std::string> tools { { "b", "brush" }, { "t", "text" },
        { "e", "eraser" }, { "c", "color" }, { "C-z", "undo" }, { "C-y", "redo" },
        { "C-Delete", "clear" }, { "C-w", "state" } };
    if (name.size() == 1 && m_doLettersRest)
        return;
    if (isPopoverVisible()) {
        if (name == "Escape")
            return hidePopover();
        const std::size_t digit = name.size() == 1 ? static_cast<std::size_t>(name[0] - '1') : 99;
        const auto &options = optionsOf(m_popover);
        if (digit < options.size())
            return choose(options[digit]);
    }
    const auto tool = tools.find(name);
    if (tool != tools.end())
        click(tool->second);
}

// The editor

void PlainBoard::edit(const std::string &key)
{
    m_doLettersRest = true;
    editIn(m_canvas.editedBox(), key);
}

void PlainBoard::editIn(const std::string &box, const std::string &key)
{
    static const std::set<std::string> deleting { "BackSpace", "Delete", "C-BackSpace",
        "C-Delete" };
    static const std::set<std::string> goingBack { "C-z", "C-y", "C-S-z" };
    PlainText &text = m_canvas.allBoxes.at(box).text;
    if (key == "C-c" || key == "C-x")
        m_copiedFrom = text.now();
    m_isCut = key == "C-x";
    m_copied = box;
    if (goingBack.count(key))
        text.goBack();
    else if (deleting.count(key) || m_isCut)
        text.replace("");
    else if (key == "C-v")
        text.replace(m_clipboard);
    else if (key == "S-Return")
        text.replace("\n");
    else if (key.size() == 1)
        text.replace(key);
}

void PlainBoard::adopt(const std::string &box, const std::string &now, const std::string &composed)
{
    m_canvas.allBoxes.at(box).text.adopt(now, composed);
}

void PlainBoard::adoptFrame(const std::string &box, Spot corner, Spot boxSize, Spot canvasSize)
{
    m_canvas.adoptFrame(box, corner, boxSize, canvasSize);
}

// Only the editor knows what was selected. What was copied is some part of the text; what was cut
// is the part that the text has lost.
void PlainBoard::adoptClipboard(const std::string &now)
{
    if (!m_copiedFrom)
        return;
    const std::string before = *std::exchange(m_copiedFrom, std::nullopt);
    const std::string &after = m_canvas.allBoxes.at(m_copied).text.now();
    const bool isPart = before.find(now) != std::string::npos;
    const bool isGone
        = before.size() == after.size() + now.size() && isReplaced(after, now, before);
    if (m_isCut ? isGone : isPart)
        m_clipboard = now;
}

void PlainBoard::compose(const std::string &half)
{
    m_canvas.allBoxes.at(m_canvas.editedBox()).text.compose(half);
}

void PlainBoard::commit(const std::string &whole)
{
    m_canvas.allBoxes.at(m_canvas.editedBox()).text.commit(whole);
}

void PlainBoard::dropOn(const std::string &target, const std::string &dropped)
{
    if (target == m_canvas.editedBox())
        m_canvas.allBoxes.at(target).text.replace(dropped);
}

// The menu of a box

void PlainBoard::openMenu(const std::string &box)
{
    m_menu = box;
    m_isMenuOfResponder = m_canvas.responder() == box;
}

// A menu stays only while its box is there, on the screen, and has not given the keys up.
std::string PlainBoard::menu()
{
    if (m_menu.empty())
        return m_menu;
    const PlainBox &box = m_canvas.allBoxes.at(m_menu);
    const bool isShown = m_isVisible && !m_isMinimised && !m_isClosed && box.isOnCanvas;
    if (!isShown || (m_isMenuOfResponder && m_canvas.responder() != m_menu))
        m_menu.clear();
    return m_menu;
}

void PlainBoard::chooseFromMenu(const std::string &item)
{
    static const std::map<std::string, std::string> keys { { "edit-undo", "C-z" },
        { "edit-redo", "C-y" }, { "edit-cut", "C-x" }, { "edit-copy", "C-c" },
        { "edit-paste", "C-v" }, { "edit-delete", "Delete" }, { "select-all", "C-a" } };
    editIn(std::exchange(m_menu, ""), keys.at(item));
}

} // namespace penwick::test
