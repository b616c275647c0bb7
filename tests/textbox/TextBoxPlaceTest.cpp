// SPDX-License-Identifier: MIT
// How large a box is for its text, in numbers.
#include "textbox/TextBoxGrowth.h"

#include <gtest/gtest.h>

namespace penwick {

namespace {

using platform::Rect;

constexpr Rect frame { 20, 100, 200, 30 };

} // namespace

TEST(TextBoxGrowth, boxReachesAsFarAsTheCanvas)
{
    EXPECT_EQ(widestTextBox(frame, 300.0), 280.0);
}

TEST(TextBoxGrowth, widestBoxIsInWholePoints)
{
    EXPECT_EQ(widestTextBox({ 20.5, 100, 200, 30 }, 300.0), 279.0);
}

TEST(TextBoxGrowth, boxWithLessRoomThanItsLeastSizeKeepsThat)
{
    EXPECT_EQ(widestTextBox({ 200, 100, 200, 30 }, 300.0), 200.0);
    EXPECT_EQ(
        textBoxFrameFor({ 200, 100, 200, 30 }, { 400, 30 }, 300.0), (Rect { 200, 100, 200, 30 }));
}

TEST(TextBoxGrowth, smallNeedsGiveTheLeastSize)
{
    EXPECT_EQ(textBoxFrameFor(frame, { 10, 10 }, 300.0), frame);
}

TEST(TextBoxGrowth, boxGrowsToTheRight)
{
    EXPECT_EQ(textBoxFrameFor(frame, { 250, 30 }, 300.0), (Rect { 20, 100, 250, 30 }));
    EXPECT_EQ(textBoxFrameFor(frame, { 500, 30 }, 300.0), (Rect { 20, 100, 280, 30 }));
}

TEST(TextBoxGrowth, boxGrowsDownwardsFromItsTopEdge)
{
    EXPECT_EQ(textBoxFrameFor(frame, { 200, 65 }, 300.0), (Rect { 20, 65, 200, 65 }));
}

TEST(TextBoxGrowth, boxEndsAtTheCanvasBottom)
{
    EXPECT_EQ(textBoxFrameFor(frame, { 200, 900 }, 300.0), (Rect { 20, 0, 200, 130 }));
}

TEST(TextBoxGrowth, boxThatStandsBelowTheCanvasKeepsTheLeastHeight)
{
    EXPECT_EQ(
        textBoxFrameFor({ 20, -24, 200, 30 }, { 200, 65 }, 300.0), (Rect { 20, -24, 200, 30 }));
}

TEST(TextBoxGrowth, boxShrinksToTheLeastSizeWithItsTopEdgeInPlace)
{
    EXPECT_EQ(textBoxFrameFor({ 20, 0, 280, 130 }, { 50, 20 }, 300.0), frame);
}

} // namespace penwick
