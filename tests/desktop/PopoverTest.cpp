// SPDX-License-Identifier: MIT
// The popovers of the tool bar: what is chosen is drawn with, and when they go away.
#include "desktop/support/ToolBarFixture.h"

namespace penwick::desktop {

namespace {

class Popover : public ToolBarTest
{
protected:
    /// Whether the board comes to show `color` there, one level more or less.
    bool shows(QPoint place, const QColor &color)
    {
        const QPoint screenPlace = onScreen(place);
        return waitUntil([&] {
            const QColor seen = desktop().screen().pixel(screenPlace);
            return std::abs(seen.red() - color.red()) <= 1
                && std::abs(seen.green() - color.green()) <= 1
                && std::abs(seen.blue() - color.blue()) <= 1;
        });
    }

    /// Rows of the board with ink in them, within `area`.
    QRect inked(const QRect &area)
    {
        QRect found;
        const QImage image = desktop().screen().picture(area.translated(canvas().topLeft()));
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (qGray(image.pixel(x, y)) < 80)
                    found |= QRect(x, y, 1, 1);
            }
        }
        return found;
    }
};

/// A colour's option, itself, and what a stroke of it is on white: at alpha 0.7.
struct Ink
{
    const char *option;
    QColor color;
    QColor onWhite;
};

class PopoverColour : public Popover, public testing::WithParamInterface<Ink>
{ };

/// A corner of the layer, by where the bar's handle is dropped.
struct Corner
{
    const char *name;
    QPoint drop;
};

/// The layer over a screen of 1280 x 800, with the bar in one of its corners.
class PopoverInACorner : public Popover, public testing::WithParamInterface<Corner>
{
protected:
    void openInTheCorner()
    {
        start({ "--window", "annotation" });
        const QRect bar = toolBar().frame;
        dragBar(GetParam().drop - QPoint(bar.center().x(), bar.top()));
        const QRect inside = QRect(0, 0, 1280, 800).adjusted(3, 25, -3, -3);
        EXPECT_TRUE(waitUntil([&] { return inside.contains(toolBar().frame); }));
        settled = toolBar().frame;
        EXPECT_TRUE(
            waitUntil([&] { return host().window(QStringLiteral("toolPanel")).frame == settled; }));
    }

    QRect settled; // the bar's frame
};

std::string cornerName(const testing::TestParamInfo<Corner> &corner)
{
    return corner.param.name;
}

std::string inkName(const testing::TestParamInfo<Ink> &ink)
{
    return std::string(ink.param.option).substr(std::string("color#").size());
}

} // namespace

TEST_P(PopoverColour, isDrawnWithAndShownOnTheColourButton)
{
    open();
    press("color");

    choose(GetParam().option);

    EXPECT_TRUE(isPopoverHidden());
    EXPECT_TRUE(waitUntil(
        [this] { return desktop().screen().pixel(centre("color")) == GetParam().color; }));
    EXPECT_TRUE(turns("brush", selected));
    EXPECT_TRUE(turns("color", normal));
    drag({ { 200, 100 }, { 400, 100 } });
    EXPECT_TRUE(shows({ 300, 100 }, GetParam().onWhite));
}

INSTANTIATE_TEST_SUITE_P(Inks, PopoverColour,
    testing::Values(Ink { "color#black", { 41, 41, 41 }, { 105, 105, 105 } },
        Ink { "color#red", { 255, 58, 104 }, { 255, 117, 149 } },
        Ink { "color#light_blue", { 0, 167, 244 }, { 77, 193, 247 } }),
    inkName);

TEST_P(PopoverInACorner, offersEveryOptionAndIsClosedByItsButton)
{
    openInTheCorner();
    const QRect screen(0, 0, 1280, 800);
    for (const char *const tool : { "brush", "color" }) {
        press(tool);

        const WindowState shown = popover();
        EXPECT_TRUE(screen.contains(shown.frame)) << tool;
        EXPECT_FALSE(shown.frame.intersects(settled)) << tool;
        EXPECT_GE(shown.buttons.size(), 4) << tool;
        for (const QPoint option : shown.buttons)
            EXPECT_TRUE(screen.adjusted(10, 10, -10, -10).contains(option)) << tool;
        press(tool);
        EXPECT_TRUE(isPopoverHidden()) << tool;
    }

    press("color");
    choose("color#white");
    EXPECT_TRUE(isPopoverHidden());
    EXPECT_TRUE(waitUntil(
        [this] { return desktop().screen().pixel(centre("color")) == QColor(Qt::white); }));
}

INSTANTIATE_TEST_SUITE_P(Corners, PopoverInACorner,
    testing::Values(Corner { "UpperLeft", { 0, 0 } }, Corner { "UpperRight", { 1279, 0 } },
        Corner { "LowerLeft", { 0, 790 } }, Corner { "LowerRight", { 1279, 790 } }),
    cornerName);

TEST_F(Popover, chosenThicknessIsDrawnWith)
{
    open();
    press("brush");

    choose("brush#12");

    EXPECT_TRUE(isPopoverHidden());
    drag({ { 200, 100 }, { 400, 100 } });
    waitForLevel({ 398, 100 }, inkOnWhite);
    for (const int y : { 95, 100, 104 })
        EXPECT_NEAR(level({ 300, y }), inkOnWhite, 1) << y;
    for (const int y : { 92, 107 })
        EXPECT_EQ(level({ 300, y }), 255) << y;
}

TEST_F(Popover, chosenSizeIsTypedWith)
{
    open();
    const QRect first(150, 60, 100, 120);
    press("text");
    click({ 200, 100 });
    desktop().keyboard().type("H");
    desktop().keyboard().press("Return"); // takes the caret away
    ASSERT_TRUE(waitUntil([&] { return inked(first).height() > 0 && inked(first).width() > 8; }));
    press("text");

    choose("text#48");
    EXPECT_TRUE(isPopoverHidden());
    const QRect second(350, 40, 100, 140);
    click({ 400, 100 });
    desktop().keyboard().type("H");
    desktop().keyboard().press("Return");

    // A capital letter of 48 points is twice as high as one of 24.
    EXPECT_TRUE(waitUntil([&] {
        const int usual = inked(first).height();
        return usual >= 16 && usual <= 20 && std::abs(inked(second).height() - 2 * usual) <= 2;
    })) << inked(first).height()
        << ", " << inked(second).height();
}

TEST_F(Popover, standsBesideItsButton)
{
    open();
    const QRect bar = toolBar().frame;

    press("color");

    const QRect shown = popover().frame;
    EXPECT_EQ(shown.size(), QSize(136, 136));
    EXPECT_EQ(shown.left(), bar.left() + 52 + 10 + 8);
    EXPECT_EQ(shown.bottom(), centre("color").y() + 18 - 1);
}

TEST_F(Popover, thirdPressOnAToolClosesIt)
{
    open();
    press("text");
    EXPECT_TRUE(turns("text", selected));
    EXPECT_FALSE(host().window(QStringLiteral("popover")).isVisible);

    press("text");
    static_cast<void>(popover());
    press("text");

    EXPECT_TRUE(isPopoverHidden());
    EXPECT_TRUE(turns("text", selected));
}

TEST_F(Popover, pressOnTheBoardHidesItAndDraws)
{
    open();
    press("color");
    static_cast<void>(popover());

    drag({ { 400, 100 }, { 500, 100 } });

    EXPECT_TRUE(isPopoverHidden());
    waitForLevel({ 498, 100 }, inkOnWhite);
}

TEST_F(Popover, movingTheBoardHidesIt)
{
    open();
    press("color");
    static_cast<void>(popover());
    const QRect frame = desktop().windows().outerFrame(window());
    const QPoint title(frame.center().x(), frame.top() + 8);

    desktop().pointer().drag({ title, title + QPoint(40, 30) });

    EXPECT_TRUE(isPopoverHidden());
    EXPECT_TRUE(comesToStandAt({ 20, 64 })); // the tool bar has followed
}

TEST_F(Popover, pressOnTheBarsHandleHidesIt)
{
    open();
    press("color");
    static_cast<void>(popover());

    dragBar({ 0, 0 });

    EXPECT_TRUE(isPopoverHidden());
}

TEST_F(Popover, anotherWindowThatTakesOverHidesIt)
{
    open();
    press("color");
    static_cast<void>(popover());

    HostProcess other(desktop());
    static_cast<void>(other.waitForWindow(QStringLiteral("drawing")));

    EXPECT_TRUE(isPopoverHidden());
}

TEST_F(Popover, isAboveTheBarAfterThatWasPressed)
{
    open();
    press("brush");
    const QRect shown = popover().frame;

    EXPECT_TRUE(waitUntil(
        [&] { return desktop().screen().pixel(shown.topLeft() + QPoint(3, 3)) == normal; }));
    const std::vector<WindowId> windows = desktop().windows().ofProcess(host().processId());
    ASSERT_EQ(windows.size(), 3U);
    EXPECT_EQ(desktop().windows().outerFrame(windows.back()), shown);
}

} // namespace penwick::desktop
