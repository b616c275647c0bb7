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

/// Laying out is what a long text costs at every key: never twice for the same width.
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

// Measured as wide as the box may become, then laid out as wide as it will be, so that text from
// the right to the left stands at the right edge of the box and not of the canvas.
platform::Size layOutText(QTextDocument &text, double canvasWidth)
{
    const double widest = std::max(1.0, std::floor(canvasWidth));
    setWidth(text, widest);
    const double ideal = std::ceil(text.idealWidth()); // lays all of it out
    const double width = isWrapped(text) ? widest : std::min(ideal, widest);
    setWidth(text, std::min(std::max(width, smallestTextBox.width), widest));
    return { width, std::ceil(text.size().height()) };
}

} // namespace penwick
