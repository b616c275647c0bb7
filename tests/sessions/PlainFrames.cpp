// SPDX-License-Identifier: MIT
#include "sessions/PlainFrames.h"

#include <algorithm>
#include <cmath>

namespace penwick::sessions {

namespace {

constexpr double screenWidth = 720; // points
constexpr double screenHeight = 540;

} // namespace

void PlainFrames::shiftPanel(double x, double y)
{
    panel.x += x;
    panel.y += y;
}

void PlainFrames::moveTo(const PlainFrame &frame)
{
    shiftPanel(frame.x - board.x, frame.y - board.y);
    board = frame;
    bringPanelUp();
}

void PlainFrames::resizeTo(const PlainFrame &frame)
{
    shiftPanel(frame.x - board.x, frame.y - board.y);
    board = frame;
    pullPanelIn();
}

void PlainFrames::restAt(const PlainFrame &frame)
{
    const double height = board.width * 9 / 16;
    const bool isReshaped = std::abs(height - board.height) > 2;
    PlainFrame kept = board;
    if (isReshaped)
        kept = { board.x, board.top() - height, board.width, height };
    // A desktop may be out by the width of the border that it draws.
    if (std::abs(frame.x - kept.x) <= 2 && std::abs(frame.y - kept.y) <= 2) {
        kept.x = frame.x;
        kept.y = frame.y;
    }
    isReshaped ? resizeTo(kept) : moveTo(kept);
}

void PlainFrames::pullPanelIn()
{
    if (panel.x < board.x + 3)
        panel.x = board.x + 23;
    if (panel.y < board.y + 3)
        panel.y = board.y + 3;
    if (panel.top() > board.top() - 25)
        panel.y = board.top() - 25 - panel.height;
    if (panel.x + panel.width > board.x + board.width - 3)
        panel.x = board.x + board.width - 3 - panel.width;
    bringPanelUp();
}

void PlainFrames::bringPanelUp()
{
    if (panel.height <= board.height - 28)
        return;
    panel.x = std::clamp(panel.x, 0.0, screenWidth - panel.width);
    panel.y = std::clamp(panel.y, 0.0, screenHeight - panel.height);
}

std::string PlainFrames::inWords() const
{
    std::string words;
    for (const PlainFrame &frame : { board, panel }) {
        for (const double value : { frame.x, frame.y, frame.width, frame.height })
            words += " " + std::to_string(std::lround(value * 2)); // panels stand on halves
        words += ",";
    }
    return words;
}

} // namespace penwick::sessions
