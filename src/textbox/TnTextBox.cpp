// SPDX-License-Identifier: MIT
#include "textbox/TnTextBox.h"

#include "platform/foundation/FatalError.h"

namespace penwick {

std::shared_ptr<TnTextBox> TnTextBox::create(
    const platform::Rect &frame, double fontSize, const QColor &fontColor)
{
    return platform::makeView<TnTextBox>(frame, fontSize, fontColor);
}

TnTextBox::TnTextBox(const platform::Rect &frame, double fontSize, const QColor &fontColor)
{
    setFrame(frame);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    viewport()->setAutoFillBackground(false);
    QFont font = this->font();
    font.setPixelSize(static_cast<int>(fontSize));
    setFont(font);
    setTextColor(fontColor);
}

TnTextBox::~TnTextBox() = default;

void TnTextBox::deleteTextBox()
{
    removeFromSuperview();
    platform::require(m_textBoxDelegate.get(), "a text box that deletes itself has no delegate")
        ->shouldDeleteTheTextBox(hash());
}

} // namespace penwick
