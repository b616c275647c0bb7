// SPDX-License-Identifier: MIT
// A border needs a layer to be on.
#include "appearance/ViewBorder.h"

#include "appearance/Theme.h"
#include "platform/ViewOf.h"

#include <QWidget>

#include <gtest/gtest.h>

namespace penwick {

namespace {

/// Any view.
class PlainView final : public platform::ViewOf<QWidget>
{ };

} // namespace

TEST(ViewBorder, layerTakesColourWidthAndRadius)
{
    PlainView view;
    view.setWantsLayer(true);

    setViewBorder(view, TnhColors::borderGreenColor, 3.0, 1.5);

    EXPECT_EQ(view.layer()->borderColor, TnhColors::borderGreenColor);
    EXPECT_EQ(view.layer()->borderWidth, 3.0);
    EXPECT_EQ(view.layer()->cornerRadius, 1.5);
    EXPECT_EQ(view.layer()->backgroundColor, QColor(Qt::transparent));
}

TEST(ViewBorder, viewWithoutALayerStaysAsItIs)
{
    PlainView view;

    setViewBorder(view, TnhColors::borderGreenColor, 3.0, 1.5);

    EXPECT_EQ(view.layer(), nullptr);
    view.setWantsLayer(true);
    EXPECT_EQ(view.layer()->borderColor, platform::Layer().borderColor);
    EXPECT_EQ(view.layer()->borderWidth, 0.0);
    EXPECT_EQ(view.layer()->cornerRadius, 0.0);
}

} // namespace penwick
