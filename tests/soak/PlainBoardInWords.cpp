// SPDX-License-Identifier: MIT
// The second model's state, as text.
#include "soak/PlainBoard.h"

#include <algorithm>

namespace penwick::test {

namespace {

std::string joined(const std::vector<std::string> &words)
{
    std::string text;
    for (const std::string &word : words)
        text += " " + word;
    return text;
}

std::string joined(const std::vector<PlainDrawing::Record> &records)
{
    std::string text;
    for (const auto &[action, name] : records)
        text += " " + action + " " + name + ",";
    return text;
}

std::string inWordsOf(const PlainText &text)
{
    return inOneLine(text.now())
        + (text.composed().empty() ? "" : "[" + inOneLine(text.composed()) + "]");
}

} // namespace

std::string inOneLine(std::string text)
{
    std::replace(text.begin(), text.end(), '\n', '/');
    return text;
}

std::string PlainBoard::inWords()
{
    std::string strokes;
    for (const std::string &name : m_drawing.strokes())
        strokes += " " + name + ":" + std::to_string(m_drawing.stroke(name).segments.size());
    std::string views;
    for (const std::string &view : m_canvas.views) {
        const PlainBox &box = m_canvas.allBoxes.at("b" + view.substr(1));
        views += " " + view;
        if (view.front() == 'x') {
            views += box.isButtonShown ? "" : "-";
            continue;
        }
        views += box.isEditable ? ":edited:" : ":placed:";
        views += inWordsOf(box.text) + "@" + std::to_string(static_cast<int>(box.x)) + ","
            + std::to_string(static_cast<int>(box.top));
    }
    std::string buttons;
    for (const std::string &name : toolNames())
        buttons
            += " " + name + (m_isSelected.at(name) ? "*" : "") + (m_isEnabled.at(name) ? "" : "-");
    std::string text = "strokes" + strokes + "\nboxes" + joined(m_drawing.boxes())
        + "\nshown strokes" + joined(m_canvas.strokes) + "\nshown boxes" + joined(m_canvas.boxes)
        + "\nundo" + joined(m_drawing.undoStack()) + "\nredo" + joined(m_drawing.redoStack())
        + "\ncount " + std::to_string(m_drawing.undoCount()) + "\nviews" + views + "\nresponder "
        + m_canvas.responder() + "\ntool " + m_canvas.currentTool + " after " + m_canvas.lastTool
        + "\ncolor " + m_canvas.color + " thickness " + m_canvas.thickness + " size "
        + m_canvas.fontSize + "\nbuttons" + buttons + "\noptions " + m_chosen.at("text") + " "
        + m_chosen.at("color") + " " + m_chosen.at("brush") + "\npopover "
        + (isPopoverVisible() ? m_popover : "") + "\nwindows" + (m_isVisible ? " drawing" : "")
        + (m_isPanelVisible ? " panel" : "") + (isBannerVisible() ? " banner" : "") + "\nframes"
        + m_frames.inWords() + "\nmenu " + menu() + "\nclipboard " + inOneLine(m_clipboard)
        + "\nposted" + joined(m_posted) + "\n";
    m_posted.clear();
    return text;
}

} // namespace penwick::test
