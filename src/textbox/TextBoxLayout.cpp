// SPDX-License-Identifier: MIT
#include "textbox/TextBoxGrowth.h"

#include <QTextDocument>

#include <algorithm>
#include <cmath>

namespace penwick {

double widestTextBox(const platform::Rect &frame, double canvasWidth)
{
    // In whole points, as the editor is: half a point less would wrap what has just fitted.
    return std::max(smallestTextBox.width, std::floor(canvasWidth - frame.x));
}

platform::Rect textBoxFrameFor(
    const platform::Rect &frame, platform::Size needed, double canvasWidth)
{
    const double top = frame.maxY();
    const double width
        = std::clamp(needed.width, smallestTextBox.width, widestTextBox(frame, canvasWidth));
    const double height = std::max(smallestTextBox.height, std::min(needed.height, top));
    return { frame.x, top - height, width, height };
}

// Measured as wide as the box may become, then laid out as wide as it will be, so that text from
// the right to the left stands at the right edge of the box and not of the canvas.
platform::Size layOutText(QTextDocument &text, const platform::Rect &frame, double canvasWidth)
{
    text.setTextWidth(widestTextBox(frame, canvasWidth));
    const double width = std::ceil(text.idealWidth());
    text.setTextWidth(textBoxFrameFor(frame, { width, 0.0 }, canvasWidth).width);
    return { width, std::ceil(text.size().height()) };
}

} // namespace penwick
