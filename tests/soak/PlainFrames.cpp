// SPDX-License-Identifier: MIT
#include "soak/PlainFrames.h"

#include <algorithm>
#include <cmath>

namespace penwick::test {

namespace {

constexpr double screenWidth = 720; // points
constexpr double screenHeight = 540;
constexpr double border = 2.5; // points, that a desktop draws, and rounding

// Windows stand on whole pixels, counted from the top left corner of the screen.
bool haveSameCorner(const PlainFrame &one, const PlainFrame &other)
{
    return std::round(one.x) == std::round(other.x)
        && std::round(screenHeight - one.top()) == std::round(screenHeight - other.top());
}

PlainFrame noLargerThanTheScreen(PlainFrame frame)
{
    const double scale = std::min(screenWidth / frame.width, screenHeight / frame.height);
    if (scale >= 1.0)
        return frame;
    frame.width *= scale;
    frame.height *= scale;
    frame.x = std::clamp(frame.x, 0.0, screenWidth - frame.width);
    frame.y = std::clamp(frame.y, 0.0, screenHeight - frame.height);
    return frame;
}

} // namespace

bool PlainFrames::isPanelTall() const
{
    return panel.height > board.height - 28;
}

// As it was placed, if it was not moved since.
PlainFrame &PlainFrames::ownPlace()
{
    if (!m_ownPlace) {
        m_ownPlace = panel;
        if (isPanelTall()) {
            m_ownPlace->x = board.x + 20;
            m_ownPlace->y = board.y + (board.height - panel.height) / 2;
        }
    }
    return *m_ownPlace;
}

void PlainFrames::shiftPanel(double x, double y)
{
    ownPlace().x += x;
    ownPlace().y += y;
}

bool PlainFrames::isAt(const PlainFrame &frame) const
{
    return haveSameCorner(frame, board) && std::round(board.width) == frame.width
        && std::round(board.height) == frame.height;
}

void PlainFrames::moveTo(const PlainFrame &frame)
{
    // Windows stand on whole pixels, and go along by as many.
    shiftPanel(std::round(frame.x) - std::round(board.x),
        std::round(screenHeight - board.top()) - std::round(screenHeight - frame.top()));
    board = frame;
    showPanel();
}

void PlainFrames::comeUpAt(const PlainFrame &frame)
{
    const double scale = std::min({ 1.0, screenWidth / board.width, screenHeight / board.height });
    PlainFrame inside { board.x, board.y, board.width * scale, board.height * scale };
    inside.x = std::clamp(board.x, 0.0, screenWidth - inside.width);
    inside.y = std::clamp(board.y, 0.0, screenHeight - inside.height);
    if (!haveSameCorner(frame, inside))
        return moveTo(frame);
    if (scale == 1.0) {
        shiftPanel(inside.x - board.x, inside.y - board.y);
    } else { // placed as if it were new
        ownPlace().x = inside.x + 20;
        ownPlace().y = inside.y + (inside.height - panel.height) / 2;
    }
    board = inside;
    showPanel();
}

void PlainFrames::resizeTo(const PlainFrame &frame)
{
    if (!m_unpulled)
        m_unpulled = board;
    shiftPanel(frame.x - board.x, frame.y - board.y);
    board = frame;
    pullPanelIn();
}

void PlainFrames::restAt(const PlainFrame &frame)
{
    PlainFrame kept = reshaped();
    const bool isReshaped = kept.width != board.width || kept.height != board.height;
    // A frame that was granted counts as it was asked for, not as it was rounded.
    const bool isGranted = haveSameCorner(frame, kept);
    // A desktop may be out by the width of the border that it draws.
    if (!isGranted && std::abs(frame.x - kept.x) < border && std::abs(frame.y - kept.y) < border) {
        kept = { frame.x, frame.y, std::round(kept.width), std::round(kept.height) };
    }
    isReshaped ? resizeTo(kept) : moveTo(kept);
    m_unpulled.reset();
}

PlainFrame PlainFrames::reshaped() const
{
    const bool isInShape = std::abs(board.width * 9 / 16 - board.height) <= 2;
    if (isInShape || !m_unpulled
        || (m_unpulled->width == board.width && m_unpulled->height == board.height))
        return board;
    const auto isSame = [](double one, double other) { return std::abs(one - other) < border; };
    const double right = board.x + board.width;
    // Nobody holds the pointer here: the desktop has put it into a half of the screen.
    const bool isHalf = (isSame(board.x, 0) && isSame(right, screenWidth))
        || (isSame(board.y, 0) && isSame(board.top(), screenHeight));
    const bool isOutward
        = !isHalf && (board.width > m_unpulled->width || board.height > m_unpulled->height);
    const bool followsWidth = (board.width * 9 > board.height * 16) == isOutward;
    PlainFrame frame = board;
    if (followsWidth)
        frame.height = board.width * 9 / 16;
    else
        frame.width = board.height * 16 / 9;
    const double unpulledRight = m_unpulled->x + m_unpulled->width;
    if (!isHalf && !isSame(board.x, m_unpulled->x) && isSame(right, unpulledRight))
        frame.x = right - frame.width;
    if (isHalf || !isSame(board.y, m_unpulled->y) || isSame(board.top(), m_unpulled->top()))
        frame.y = board.top() - frame.height;
    return noLargerThanTheScreen(frame);
}

void PlainFrames::letPanelGo()
{
    m_ownPlace = panel;
    pullPanelIn();
}

void PlainFrames::pullPanelIn()
{
    PlainFrame &own = ownPlace();
    if (own.x < board.x + 3)
        own.x = board.x + 23;
    if (own.y < board.y + 3)
        own.y = board.y + 3;
    if (own.top() > board.top() - 25)
        own.y = board.top() - 25 - own.height;
    if (own.x + own.width > board.x + board.width - 3)
        own.x = board.x + board.width - 3 - own.width;
    showPanel();
}

void PlainFrames::showPanel()
{
    panel = ownPlace();
    if (!isPanelTall())
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

} // namespace penwick::test
