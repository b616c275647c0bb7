// SPDX-License-Identifier: MIT
#include "sessions/PlainFrames.h"

#include <cmath>

namespace penwick::sessions {

void PlainFrames::shiftPanel(double x, double y)
{
    panel.x += x;
    panel.y += y;
}

void PlainFrames::moveTo(const PlainFrame &frame)
{
    shiftPanel(frame.x - board.x, frame.y - board.y);
    board = frame;
}

void PlainFrames::resizeTo(const PlainFrame &frame)
{
    moveTo(frame);
    pullPanelIn();
}

void PlainFrames::keepShape()
{
    const double height = board.width * 9 / 16;
    if (std::abs(height - board.height) > 2)
        resizeTo({ board.x, board.top() - height, board.width, height });
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
