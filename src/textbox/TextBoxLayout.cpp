// SPDX-License-Identifier: MIT
#include "textbox/TextBoxLayout.h"

#include "textbox/TextBoxPlace.h"

#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>

#include <algorithm>
#include <cmath>

namespace penwick {

namespace {

/// Laying out a long text takes time and happens at every key, so it is not repeated for a width
/// that the text has already.
void setWidth(QTextDocument &text, double width)
{
    if (text.textWidth() != width)
        text.setTextWidth(width);
}

bool isWrapped(const QTextBlock &block)
{
    const QTextLayout &layout = *block.layout();
    for (int number = 0; number + 1 < layout.lineCount(); ++number) {
        const QTextLine line = layout.lineAt(number);
        const int last = line.textStart() + line.textLength() - 1;
        if (last < 0 || block.text().at(last) != QChar::LineSeparator)
            return true;
    }
    return false;
}

bool isWrapped(const QTextDocument &text)
{
    for (QTextBlock block = text.begin(); block.isValid(); block = block.next()) {
        if (isWrapped(block))
            return true;
    }
    return false;
}

} // namespace

// The text is laid out in the largest width that the box may get, which measures it, and then in
// the width that the box will have. In the first width a text that runs from right to left stands
// at the right edge of the canvas, not of the box.
platform::Size layOutText(QTextDocument &text, double canvasWidth)
{
    const double widest = std::max(1.0, std::floor(canvasWidth));
    setWidth(text, widest);
    const double ideal = std::ceil(text.idealWidth()); // this call lays the whole text out
    const double width = isWrapped(text) ? widest : std::min(ideal, widest);
    setWidth(text, std::min(std::max(width, smallestTextBox.width), widest));
    return { width, std::ceil(text.size().height()) };
}

} // namespace penwick
