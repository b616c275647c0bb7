// SPDX-License-Identifier: MIT
// Where a box stands, in numbers: on a canvas of 300 by 200 points.
#include "textbox/TextBoxPlace.h"

#include <gtest/gtest.h>

#include <ostream>

namespace penwick::test {

namespace {

using platform::Rect;
using platform::Size;

constexpr Size canvas { 300, 200 };

struct Sight
{
    const char *name;
    Rect frame;
    Size needed;
    Rect result;

    friend std::ostream &operator<<(std::ostream &stream, const Sight &sight)
    {
        return stream << sight.name;
    }
};

class TextBoxInSight : public testing::TestWithParam<Sight>
{ };

struct Reach
{
    const char *name;
    Rect frame;
    Rect result;

    friend std::ostream &operator<<(std::ostream &stream, const Reach &reach)
    {
        return stream << reach.name;
    }
};

class TextBoxInReach : public testing::TestWithParam<Reach>
{ };

} // namespace

TEST_P(TextBoxInSight, liesOnTheCanvasWithItsDeleteButton)
{
    EXPECT_EQ(frameInSight(GetParam().frame, GetParam().needed, canvas), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(Boxes, TextBoxInSight,
    testing::Values(
        // Where it need not move
        Sight {
            "smallNeedsGiveTheLeastSize", { 20, 100, 200, 30 }, { 10, 10 }, { 20, 100, 200, 30 } },
        Sight { "growsToTheRight", { 20, 100, 200, 30 }, { 250, 30 }, { 20, 100, 250, 30 } },
        Sight { "growsDownwards", { 20, 100, 200, 30 }, { 200, 65 }, { 20, 65, 200, 65 } },
        Sight { "shrinksToTheLeastSizeWithItsTopInPlace", { 20, 0, 259, 130 }, { 50, 20 },
            { 20, 100, 200, 30 } },
        // The edges
        Sight { "atTheRightEdge", { 79, 100, 200, 30 }, { 10, 10 }, { 79, 100, 200, 30 } },
        Sight { "pastTheRightEdge", { 80, 100, 200, 30 }, { 10, 10 }, { 79, 100, 200, 30 } },
        Sight { "growsToTheLeftFromTheRightEdge", { 79, 100, 200, 30 }, { 240, 30 },
            { 39, 100, 240, 30 } },
        Sight { "pastTheLeftEdge", { -7, 100, 200, 30 }, { 10, 10 }, { 0, 100, 200, 30 } },
        Sight { "atTheBottom", { 20, 35, 200, 30 }, { 200, 65 }, { 20, 0, 200, 65 } },
        Sight { "upwardsFromTheBottom", { 20, -24, 200, 30 }, { 200, 65 }, { 20, 0, 200, 65 } },
        Sight { "atTheTop", { 20, 149, 200, 30 }, { 10, 10 }, { 20, 149, 200, 30 } },
        Sight { "pastTheTop", { 20, 176, 200, 30 }, { 10, 10 }, { 20, 149, 200, 30 } },
        Sight { "pastACorner", { 290, -20, 200, 30 }, { 210, 40 }, { 69, 0, 210, 40 } },
        // Where there is no room for the delete button
        Sight { "asWideAsTheButtonAllows", { 20, 100, 200, 30 }, { 279, 30 }, { 0, 100, 279, 30 } },
        Sight { "tooWideForTheButton", { 20, 176, 200, 30 }, { 280, 30 }, { 20, 170, 280, 30 } },
        Sight {
            "asHighAsTheButtonAllows", { 20, 100, 200, 30 }, { 200, 179 }, { 20, 0, 200, 179 } },
        Sight { "tooHighForTheButton", { 95, 100, 200, 30 }, { 200, 180 }, { 95, 0, 200, 180 } },
        // Larger than the canvas
        Sight { "widerThanTheCanvas", { 20, 100, 200, 30 }, { 900, 30 }, { 0, 100, 300, 30 } },
        Sight { "higherThanTheCanvas", { 20, 100, 200, 30 }, { 200, 900 }, { 20, 0, 200, 200 } },
        Sight { "largerThanTheCanvas", { 20, 100, 200, 30 }, { 900, 900 }, { 0, 0, 300, 200 } }),
    [](const auto &sight) { return std::string(sight.param.name); });

TEST(TextBoxPlace, canvasOfHalfPointsIsTakenInWholeOnes)
{
    EXPECT_EQ(frameInSight({ 20, 100, 200, 30 }, { 900, 900 }, { 300.5, 200.5 }),
        (Rect { 0, 0, 300, 200 }));
}

TEST(TextBoxPlace, boxThatFillsItsCanvasTogetherWithItsButtonHasRoomForIt)
{
    EXPECT_EQ(
        frameInSight({ 20, 100, 200, 30 }, { 10, 10 }, { 221, 51 }), (Rect { 0, 0, 200, 30 }));
    EXPECT_EQ(
        frameInSight({ 20, 100, 200, 30 }, { 10, 10 }, { 220, 51 }), (Rect { 20, 21, 200, 30 }));
    EXPECT_EQ(
        frameInSight({ 20, 100, 200, 30 }, { 10, 10 }, { 221, 50 }), (Rect { 20, 20, 200, 30 }));
}

TEST(TextBoxPlace, canvasSmallerThanTheLeastBoxIsFilled)
{
    EXPECT_EQ(
        frameInSight({ 20, 100, 200, 30 }, { 10, 10 }, { 150, 20 }), (Rect { 0, 0, 150, 20 }));
    EXPECT_EQ(frameInSight({ 20, 100, 200, 30 }, { 10, 10 }, { 0, 0 }), (Rect { 0, 0, 1, 1 }));
}

TEST_P(TextBoxInReach, keepsTwentyPointsOnTheCanvas)
{
    EXPECT_EQ(frameInReach(GetParam().frame, canvas), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(Boxes, TextBoxInReach,
    testing::Values(Reach { "inside", { 20, 100, 200, 30 }, { 20, 100, 200, 30 } },
        Reach { "farEnoughLeft", { -180, 100, 200, 30 }, { -180, 100, 200, 30 } },
        Reach { "tooFarLeft", { -181, 100, 200, 30 }, { -180, 100, 200, 30 } },
        Reach { "farEnoughRight", { 280, 100, 200, 30 }, { 280, 100, 200, 30 } },
        Reach { "tooFarRight", { 280.5, 100, 200, 30 }, { 280, 100, 200, 30 } },
        Reach { "farEnoughDown", { 20, -10, 200, 30 }, { 20, -10, 200, 30 } },
        Reach { "tooFarDown", { 20, -500, 200, 30 }, { 20, -10, 200, 30 } },
        Reach { "farEnoughUp", { 20, 180, 200, 30 }, { 20, 180, 200, 30 } },
        Reach { "tooFarUp", { 20, 181, 200, 30 }, { 20, 180, 200, 30 } },
        Reach { "pastACorner", { 900, -900, 200, 30 }, { 280, -10, 200, 30 } },
        Reach { "lessThanTwentyPointsWide", { -40, 100, 10, 30 }, { 0, 100, 10, 30 } }),
    [](const auto &reach) { return std::string(reach.param.name); });

TEST(TextBoxPlace, boxIsReachedOnACanvasOfLessThanTwentyPoints)
{
    EXPECT_EQ(frameInReach({ 50, 50, 200, 30 }, { 15, 10 }), (Rect { 0, 0, 200, 30 }));
    EXPECT_EQ(frameInReach({ -500, -50, 200, 30 }, { 15, 10 }), (Rect { -185, -20, 200, 30 }));
}

} // namespace penwick::test
