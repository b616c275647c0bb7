// SPDX-License-Identifier: MIT
// A border needs a layer to be on.
#include "appearance/ViewBorder.h"

#include "appearance/Theme.h"
#include "platform/view/ViewOf.h"

#include <QTest>
#include <QWidget>

#include <gtest/gtest.h>

namespace penwick::test {

namespace {

/// Any view; counts how often it is painted.
class CountingView final : public platform::ViewOf<QWidget>
{
public:
    int paints = 0;

protected:
    void paintEvent(QPaintEvent *event) override
    {
        ++paints;
        ViewOf<QWidget>::paintEvent(event);
    }
};

} // namespace

TEST(ViewBorder, layerTakesColourWidthAndRadius)
{
    CountingView view;
    view.setWantsLayer(true);

    setViewBorder(view, TnhColors::borderGreenColor, 3.0, 1.5);

    EXPECT_EQ(view.layer()->borderColor, TnhColors::borderGreenColor);
    EXPECT_EQ(view.layer()->borderWidth, 3.0);
    EXPECT_EQ(view.layer()->cornerRadius, 1.5);
    EXPECT_EQ(view.layer()->backgroundColor, QColor(Qt::transparent));
}

TEST(ViewBorder, borderIsShownAtOnce)
{
    CountingView view;
    view.setWantsLayer(true);
    view.show();
    ASSERT_TRUE(QTest::qWaitFor([&view] { return view.paints > 0; }));
    QCoreApplication::processEvents();
    const int before = view.paints;

    setViewBorder(view, TnhColors::borderGreenColor, 3.0, 1.5);

    EXPECT_TRUE(QTest::qWaitFor([&view, before] { return view.paints > before; }));
}

TEST(ViewBorder, viewWithoutALayerStaysAsItIs)
{
    CountingView view;

    setViewBorder(view, TnhColors::borderGreenColor, 3.0, 1.5);

    EXPECT_EQ(view.layer(), nullptr);
    view.setWantsLayer(true);
    EXPECT_EQ(view.layer()->borderColor, platform::Layer().borderColor);
    EXPECT_EQ(view.layer()->borderWidth, 0.0);
    EXPECT_EQ(view.layer()->cornerRadius, 0.0);
}

} // namespace penwick::test
