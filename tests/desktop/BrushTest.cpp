// SPDX-License-Identifier: MIT
// Strokes of the brush as they appear on the screen.
#include "desktop/support/BoardFixture.h"

#include <QPainter>

namespace penwick::desktop {

namespace {

class Brush : public BoardTest
{ };

class BrushWithAnotherButton : public BoardTest, public testing::WithParamInterface<MouseButton>
{ };

std::string buttonName(const testing::TestParamInfo<MouseButton> &button)
{
    return button.param == MouseButton::Middle ? "middle" : "right";
}

} // namespace

TEST_F(Brush, strokeAppearsWhereThePointerWent)
{
    open();

    drag({ { 100, 100 }, { 300, 100 }, { 300, 250 } });

    waitForLevel({ 300, 248 }, inkOnWhite);
    EXPECT_NEAR(level({ 100, 100 }), inkOnWhite, 1);
    EXPECT_NEAR(level({ 200, 100 }), inkOnWhite, 1);
    EXPECT_NEAR(level({ 300, 100 }), inkOnWhite, 1);
    EXPECT_NEAR(level({ 300, 170 }), inkOnWhite, 1);
    EXPECT_EQ(level({ 200, 110 }), 255);
    EXPECT_EQ(level({ 90, 100 }), 255);
    EXPECT_EQ(level({ 300, 260 }), 255);
}

TEST_F(Brush, strokeIsFivePointsWide)
{
    open();

    drag({ { 100, 100 }, { 300, 100 } });

    waitForLevel({ 298, 100 }, inkOnWhite);
    for (int y = 98; y <= 101; ++y)
        EXPECT_NEAR(level({ 200, y }), inkOnWhite, 1) << y;
    // The middle of the stroke is the border between two pixels: its edges cover half a pixel.
    for (const int y : { 97, 102 }) {
        EXPECT_GT(level({ 200, y }), inkOnWhite) << y;
        EXPECT_LT(level({ 200, y }), 255) << y;
    }
    EXPECT_EQ(level({ 200, 96 }), 255);
    EXPECT_EQ(level({ 200, 103 }), 255);
}

TEST_F(Brush, strokeIsNowhereDarkerWhereItsSegmentsMeetOrCross)
{
    open();

    drag({ { 100, 100 }, { 300, 130 }, { 120, 160 }, { 320, 210 }, { 180, 80 }, { 180, 240 } });

    waitForLevel({ 180, 238 }, inkOnWhite);
    EXPECT_NEAR(darkest(picture()), inkOnWhite, 1);
}

TEST_F(Brush, twoStrokesThatCrossAreDarkerThere)
{
    open();

    drag({ { 100, 150 }, { 300, 150 } });
    drag({ { 200, 50 }, { 200, 250 } });

    waitForLevel({ 200, 248 }, inkOnWhite);
    waitForLevel({ 200, 150 }, inkOnInk);
}

TEST_F(Brush, clickWithoutADragLeavesNoMark)
{
    open();
    settle();
    const QImage before = picture();

    click({ 300, 200 });

    settle();
    QImage after = picture();
    QPainter(&after).drawImage(settlingArea.topLeft(), before, settlingArea);
    EXPECT_EQ(difference(after, before), QRect());
}

TEST_P(BrushWithAnotherButton, dragDrawsNothingAndTheBrushStillWorks)
{
    open();

    drag({ { 100, 100 }, { 300, 100 } }, GetParam());
    click({ 200, 200 }, GetParam());

    EXPECT_EQ(darkest(picture()), 255);
    drag({ { 100, 300 }, { 300, 300 } });
    waitForLevel({ 298, 300 }, inkOnWhite);
    EXPECT_EQ(level({ 200, 100 }), 255);
    EXPECT_EQ(level({ 200, 200 }), 255);
    EXPECT_EQ(host().errorOutput(), QString());
    EXPECT_EQ(host().notifications().size(), 2U); // undo and redo of the one stroke
}

INSTANTIATE_TEST_SUITE_P(Buttons, BrushWithAnotherButton,
    testing::Values(MouseButton::Middle, MouseButton::Right), buttonName);

} // namespace penwick::desktop
