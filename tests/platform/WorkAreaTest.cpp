// SPDX-License-Identifier: MIT
// Where a window that is shown stands: inside its screen's work area, beside what must stay free.
#include "platform/window/WorkArea.h"

#include "platform/foundation/Placement.h"

#include <gtest/gtest.h>

#include <string>

namespace penwick::platform {

namespace {

constexpr Rect area { 100.0, 50.0, 800.0, 600.0 }; // up to 900 and 650

struct Shown
{
    const char *situation;
    Rect frame;
    Rect expected;
    KeptEdge edge = KeptEdge::Top;
};

struct ShownBeside
{
    const char *situation;
    Rect frame;
    Rect free;
    Rect expected;
    Rect area = penwick::platform::area;
};

template <class Row>
std::string situation(const testing::TestParamInfo<Row> &row)
{
    return row.param.situation;
}

class WorkArea : public testing::TestWithParam<Shown>
{ };

class WorkAreaBeside : public testing::TestWithParam<ShownBeside>
{ };

} // namespace

TEST_P(WorkArea, windowIsBroughtInside)
{
    const Shown &row = GetParam();

    EXPECT_EQ(broughtInside(row.frame, area, row.edge), row.expected);
}

INSTANTIATE_TEST_SUITE_P(Frames, WorkArea,
    testing::Values(Shown { "insideStays", { 200, 100, 50, 60 }, { 200, 100, 50, 60 } },
        Shown { "filledStays", area, area },
        Shown { "atTheEdgesStays", { 850, 590, 50, 60 }, { 850, 590, 50, 60 } },
        Shown { "farLeft", { -500, 100, 50, 60 }, { 100, 100, 50, 60 } },
        Shown { "aLittleRight", { 851, 100, 50, 60 }, { 850, 100, 50, 60 } },
        Shown { "below", { 200, 49, 50, 60 }, { 200, 50, 50, 60 } },
        Shown { "above", { 200, 900, 50, 60 }, { 200, 590, 50, 60 } },
        Shown { "corner", { 1000, -20, 50, 60 }, { 850, 50, 50, 60 } },
        Shown { "fractionsAreKept", { 200.5, 10, 50.25, 60 }, { 200.5, 50, 50.25, 60 } },
        Shown { "tooWideKeepsItsLeftEdge", { 300, 100, 900, 60 }, { 100, 100, 900, 60 } },
        Shown { "tooHighKeepsItsTop", { 200, 0, 50, 700 }, { 200, -50, 50, 700 } },
        Shown { "tooHighKeepsItsBottom", { 200, -20, 50, 700 }, { 200, 50, 50, 700 },
            KeptEdge::Bottom },
        Shown { "whatFitsDoesNotCareForTheEdge", { 200, 900, 50, 60 }, { 200, 590, 50, 60 },
            KeptEdge::Bottom },
        Shown { "asHighAsTheAreaHasBoth", { 200, 0, 50, 600 }, { 200, 50, 50, 600 } }),
    situation<Shown>);

TEST_P(WorkAreaBeside, windowLeavesFreeWhatIsToStayFree)
{
    const ShownBeside &row = GetParam();

    const Rect shown = broughtInsideBeside(row.frame, row.area, row.free);

    EXPECT_EQ(shown, row.expected);
    EXPECT_FALSE(shown.intersects(row.free));
}

INSTANTIATE_TEST_SUITE_P(Frames, WorkAreaBeside,
    testing::Values(ShownBeside { "roomWhereItWantsToBe", { 320, 200, 136, 136 },
                        { 250, 100, 52, 352 }, { 320, 200, 136, 136 } },
        ShownBeside {
            "upIsEnough", { 320, 10, 136, 136 }, { 250, 60, 52, 352 }, { 320, 50, 136, 136 } },
        ShownBeside {
            "downIsEnough", { 320, 600, 136, 136 }, { 250, 260, 52, 352 }, { 320, 514, 136, 136 } },
        ShownBeside { "nearerIsEnough", { 770, 200, 136, 136 }, { 700, 100, 52, 352 },
            { 764, 200, 136, 136 } },
        ShownBeside { "leftOfWhatStandsAtTheRight", { 918, 200, 136, 136 }, { 848, 100, 52, 352 },
            { 694, 200, 136, 136 } },
        ShownBeside {
            "leftAndDown", { 918, 600, 136, 136 }, { 848, 290, 52, 352 }, { 694, 514, 136, 136 } },
        ShownBeside { "rightOfWhatStandsAtTheLeft", { -70, 200, 136, 136 }, { 84, 100, 52, 352 },
            { 154, 200, 136, 136 } },
        ShownBeside { "nearerOnTheOtherSideToo", { 318, 200, 136, 136 }, { 248, 100, 52, 352 },
            { 110, 200, 136, 136 }, { 110, 50, 200, 600 } },
        ShownBeside { "aboveWhereThereIsNoSide", { 170, 100, 136, 136 }, { 110, 100, 52, 100 },
            { 154, 200, 136, 136 }, { 110, 50, 180, 600 } },
        ShownBeside { "belowWhereThereIsNothingAbove", { 170, 500, 136, 136 },
            { 110, 500, 52, 100 }, { 124, 364, 136, 136 }, { 110, 50, 150, 600 } },
        ShownBeside { "apartFromWhatItWouldCover", { 300, 300, 136, 136 }, { 310, 310, 50, 50 },
            { 174, 300, 136, 136 } }),
    situation<ShownBeside>);

TEST(WorkAreaBeside, withoutRoomOnAnySideItIsInsideAllTheSame)
{
    const Rect small { 0.0, 0.0, 150.0, 150.0 };

    EXPECT_EQ(broughtInsideBeside({ 60, 20, 136, 136 }, small, { 10, 10, 52, 130 }),
        (Rect { 14, 14, 136, 136 }));
}

// Two screens: 1920 x 1080 and, right of it and 200 lower, 1280 x 720.
TEST(WorkAreaOfScreens, isThatOfTheScreenWithMostOfTheWindow)
{
    const Rect primary { 0, 0, 1920, 1080 };
    const Rect secondary { 1920, 160, 1280, 720 };

    EXPECT_EQ(workAreaFor({ 100, 100, 400, 300 }), primary);
    EXPECT_EQ(workAreaFor({ 2000, 200, 400, 300 }), secondary);
    EXPECT_EQ(workAreaFor({ 1719, 200, 400, 300 }), primary);
    EXPECT_EQ(workAreaFor({ 1721, 200, 400, 300 }), secondary);
    EXPECT_EQ(workAreaFor({ 1880, 500, 400, 900 }), secondary);
}

TEST(WorkAreaOfScreens, isThePrimaryScreensForAWindowOnNone)
{
    const Rect primary { 0, 0, 1920, 1080 };

    EXPECT_EQ(workAreaFor({ 5000, 5000, 400, 300 }), primary);
    EXPECT_EQ(workAreaFor({ 2000, 200, 0, 0 }), primary);
}

} // namespace penwick::platform
