// SPDX-License-Identifier: MIT
// Frames and pictures that keep a shape.
#include "platform/foundation/KeptShape.h"

#include <gtest/gtest.h>

#include <string>

namespace penwick::platform {

namespace {

constexpr Rect area { 100.0, 50.0, 1200.0, 800.0 }; // up to 1300 and 850
constexpr Size sixteenToNine { 16.0, 9.0 };
constexpr Rect before { 200.0, 100.0, 600.0, 450.0 }; // up to 800 and 550
constexpr Rect board { 200.0, 100.0, 640.0, 360.0 }; // up to 840 and 460

struct Shown
{
    const char *situation;
    Rect frame;
    Rect expected;
};

struct Fitted
{
    const char *situation;
    Size picture;
    Size room;
    Size expected;
};

struct Pulled
{
    const char *situation;
    Rect pulled;
    Rect expected;
    Rect before = penwick::platform::before;
    Size ratio = sixteenToNine;
    Rect area { -1000.0, -1000.0, 4000.0, 3000.0 };
};

template <class Row>
std::string situation(const testing::TestParamInfo<Row> &row)
{
    return row.param.situation;
}

class ShownInShape : public testing::TestWithParam<Shown>
{ };

class PictureInRoom : public testing::TestWithParam<Fitted>
{ };

class PulledFrame : public testing::TestWithParam<Pulled>
{ };

void expectNear(const Rect &is, const Rect &expected)
{
    constexpr double rounding = 1e-9;
    EXPECT_NEAR(is.x, expected.x, rounding);
    EXPECT_NEAR(is.y, expected.y, rounding);
    EXPECT_NEAR(is.width, expected.width, rounding);
    EXPECT_NEAR(is.height, expected.height, rounding);
}

} // namespace

TEST_P(ShownInShape, windowIsBroughtInside)
{
    expectNear(broughtInsideInShape(GetParam().frame, area), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Frames, ShownInShape,
    testing::Values(Shown { "insideStays", { 200, 100, 600, 400 }, { 200, 100, 600, 400 } },
        Shown { "filledStays", area, area },
        Shown { "asLargeAsTheAreaOnlyMoves", { 300, 183, 1200, 800 }, area },
        Shown { "smallOnesOnlyMove", { 1250, 20, 100, 60 }, { 1200, 50, 100, 60 } },
        Shown { "twiceTheAreaIsHalved", { 300, 183, 2400, 1600 }, area },
        Shown { "wider", { 300, 183, 2400, 400 }, { 100, 183, 1200, 200 } },
        Shown { "higher", { 300, 183, 400, 1600 }, { 300, 50, 200, 800 } },
        Shown { "bothWaysTheWidthDecides", { 0, 0, 2400, 1200 }, { 100, 50, 1200, 600 } },
        Shown { "bothWaysTheHeightDecides", { 0, 0, 1800, 1600 }, { 100, 50, 900, 800 } },
        Shown { "smallerThanTheAreaOneWayOnly", { 900, 700, 1300, 200 },
            { 100, 850 - 200.0 * 12 / 13, 1200, 200.0 * 12 / 13 } },
        Shown { "veryFlat", { 0, 0, 12000, 100 }, { 100, 50, 1200, 10 } }),
    situation<Shown>);

TEST_P(PictureInRoom, isScaledDownAndNeverUp)
{
    EXPECT_EQ(scaledDownInto(GetParam().picture, GetParam().room), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Pictures, PictureInRoom,
    testing::Values(Fitted { "thatFitsStays", { 400, 300 }, { 400, 300 }, { 400, 300 } },
        Fitted { "thatIsSmallerStays", { 400, 300 }, { 4000, 3000 }, { 400, 300 } },
        Fitted { "halfAPointStays", { 400.5, 300.25 }, { 500, 301 }, { 400.5, 300.25 } },
        Fitted { "underATitleBar", { 600, 400 }, { 598, 375 }, { 563, 375 } },
        Fitted { "theWidthDecides", { 600, 100 }, { 300, 90 }, { 300, 50 } },
        Fitted { "theHeightDecides", { 100, 600 }, { 90, 300 }, { 50, 300 } },
        Fitted { "nothingIsLessThanAPoint", { 6000, 10 }, { 300, 90 }, { 300, 1 } },
        Fitted { "norWhereThereIsNoRoom", { 40, 30 }, { 38, 0 }, { 1, 1 } }),
    situation<Fitted>);

TEST_P(PulledFrame, hasTheShape)
{
    const Pulled &row = GetParam();

    const Rect shaped = shapedAfterPull(row.before, row.pulled, row.ratio, row.area);

    expectNear(shaped, row.expected);
    if (row.pulled.width > row.before.width || row.pulled.height > row.before.height) {
        EXPECT_GE(shaped.width, row.pulled.width);
        EXPECT_GE(shaped.height, row.pulled.height);
    } else {
        EXPECT_LE(shaped.width, row.pulled.width);
        EXPECT_LE(shaped.height, row.pulled.height);
    }
}

INSTANTIATE_TEST_SUITE_P(OtherShapes, PulledFrame,
    testing::Values(Pulled { "rightOut", { 200, 100, 612, 450 }, { 200, 100, 800, 450 } },
        Pulled { "leftOut", { 188, 100, 612, 450 }, { 0, 100, 800, 450 } },
        Pulled { "topOut", { 200, 100, 600, 459 }, { 200, 100, 816, 459 } },
        Pulled { "bottomOut", { 200, 91, 600, 459 }, { 200, 91, 816, 459 } },
        Pulled { "farRightOut", { 200, 100, 960, 450 }, { 200, 10, 960, 540 } },
        Pulled { "topRightOut", { 200, 100, 612, 459 }, { 200, 100, 816, 459 } },
        Pulled { "bottomLeftOut", { 188, 91, 612, 459 }, { -16, 91, 816, 459 } },
        Pulled { "rightIn", { 200, 100, 480, 450 }, { 200, 280, 480, 270 } },
        Pulled { "leftIn", { 320, 100, 480, 450 }, { 320, 280, 480, 270 } },
        Pulled { "topIn", { 200, 100, 600, 270 }, { 200, 100, 480, 270 } },
        Pulled { "bottomIn", { 200, 280, 600, 270 }, { 200, 280, 480, 270 } },
        Pulled { "outOneWayAndInTheOther", { 200, 200, 640, 350 }, { 200, 190, 640, 360 } }),
    situation<Pulled>);

INSTANTIATE_TEST_SUITE_P(SixteenToNine, PulledFrame,
    testing::Values(Pulled { "rightOut", { 200, 100, 656, 360 }, { 200, 91, 656, 369 }, board },
        Pulled { "topOut", { 200, 100, 640, 369 }, { 200, 100, 656, 369 }, board },
        Pulled { "leftIn", { 216, 100, 624, 360 }, { 216, 109, 624, 351 }, board },
        Pulled { "bottomIn", { 200, 109, 640, 351 }, { 200, 109, 624, 351 }, board },
        Pulled { "squareOut", { 200, 100, 200, 210 }, { 200, 100, 210, 210 },
            { 200, 100, 200, 200 }, { 1, 1 } }),
    situation<Pulled>);

// Of a board of 640 by 360 in an area of 1200 by 800.

TEST(PulledBeyondTheScreen, boardIsAsLargeAsTheWorkAreaAllowsAndInsideIt)
{
    expectNear(
        shapedAfterPull(board, { 200, 50, 640, 790 }, sixteenToNine, area), { 100, 50, 1200, 675 });
    expectNear(shapedAfterPull(board, { 200, 100, 1300, 360 }, sixteenToNine, area),
        { 100, 50, 1200, 675 });
}

TEST(PulledBeyondTheScreen, boardThatIsNotLargerThanTheAreaStaysWhereItIsPulled)
{
    expectNear(shapedAfterPull(board, { 700, 100, 1100, 360 }, sixteenToNine, area),
        { 700, 460 - 618.75, 1100, 618.75 });
}

TEST(PulledInASmallerArea, isShapedAllTheSame)
{
    expectNear(shapedAfterPull(board, { 200, 100, 480, 360 }, sixteenToNine, area),
        { 200, 190, 480, 270 });
}

TEST(FrameThatSpans, goesFromEdgeToEdgeOneWayAtLeast)
{
    EXPECT_TRUE(spans({ 100, 50, 600, 800 }, area));
    EXPECT_TRUE(spans({ 700, 52, 600, 797 }, area)) << "but for a border";
    EXPECT_TRUE(spans({ 100, 450, 1200, 400 }, area));
    EXPECT_TRUE(spans(area, area));
    EXPECT_FALSE(spans({ 100, 50, 600, 790 }, area));
    EXPECT_FALSE(spans({ 100, 53, 600, 797 }, area));
    EXPECT_FALSE(spans({ 103, 450, 1197, 400 }, area));
    EXPECT_FALSE(spans({ 100, 450, 1190, 400 }, area));
    EXPECT_FALSE(spans({ 100, 20, 600, 800 }, area)) << "as high, but elsewhere";
}

TEST(ShapedInside, isTheLargestInTheTopLeftCorner)
{
    expectNear(shapedInside({ 100, 50, 600, 800 }, sixteenToNine), { 100, 512.5, 600, 337.5 });
    expectNear(
        shapedInside({ 100, 450, 1200, 400 }, sixteenToNine), { 100, 450, 400.0 * 16 / 9, 400 });
}

} // namespace penwick::platform
