// SPDX-License-Identifier: MIT
#include "toolpanel/PopoverView.h"

#include "appearance/Theme.h"
#include "appearance/ViewBorder.h"

namespace penwick {

namespace {

constexpr double borderWidth = 0.5; // points
constexpr double borderRadius = 2.0; // points

} // namespace

PopoverView::PopoverView(QWidget *parent)
    : ViewOf(parent)
{ }

PopoverView::PopoverView(const platform::Rect &frame)
    : PopoverView(nullptr)
{
    setFrame(frame);
}

void PopoverView::viewDidMoveToWindow()
{
    setWantsLayer(true);
    setUpLayer();
}

void PopoverView::setUpLayer()
{
    setWantsLayer(true);
    layer()->backgroundColor = ToolPanelUI::toolPanelColor;
    setViewBorder(*this, PopoverUI::popoverBackgroundColor, borderWidth, borderRadius);
}

} // namespace penwick
