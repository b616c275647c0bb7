// SPDX-License-Identifier: MIT
// Where a panel is pulled to in its parent's frame.
#include "session/PanelClamp.h"

#include <gtest/gtest.h>

#include <string>

namespace penwick::test {

namespace {

using platform::Rect;

constexpr Rect parent { 0, 0, 1280, 720 };

struct Case
{
    const char *name;
    Rect parent;
    Rect panel;
    Rect clamped;
};

class PanelClamp : public testing::TestWithParam<Case>
{ };

std::string caseName(const testing::TestParamInfo<Case> &testCase)
{
    return testCase.param.name;
}

} // namespace

TEST_P(PanelClamp, puts)
{
    EXPECT_EQ(clampedPanel(GetParam().panel, GetParam().parent), GetParam().clamped);
}

INSTANTIATE_TEST_SUITE_P(Panels, PanelClamp,
    testing::Values(Case { "oneInsideNowhere", parent, { 100, 50, 60, 400 }, { 100, 50, 60, 400 } },
        Case { "oneOnTheLeftEdgeFurtherIn", parent, { 1, 10, 60, 400 }, { 23, 10, 60, 400 } },
        Case { "oneFarLeftFurtherIn", parent, { -500, 10, 60, 400 }, { 23, 10, 60, 400 } },
        Case { "oneAtTheLeftMarginNowhere", parent, { 3, 10, 60, 400 }, { 3, 10, 60, 400 } },
        Case { "oneJustBeyondTheLeftMarginFurtherIn", parent, { 2.5, 10, 60, 400 },
            { 23, 10, 60, 400 } },
        Case { "oneTooHighUnderTheTitleBar", parent, { 1, 300, 60, 400 }, { 23, 295, 60, 400 } },
        Case { "oneAtTheTopLimitNowhere", parent, { 100, 295, 60, 400 }, { 100, 295, 60, 400 } },
        Case { "oneTooLowUp", parent, { 100, 2, 60, 400 }, { 100, 3, 60, 400 } },
        Case { "oneAtTheBottomMarginNowhere", parent, { 100, 3, 60, 400 }, { 100, 3, 60, 400 } },
        Case { "oneOnTheRightEdgeBack", parent, { 1250, 50, 60, 400 }, { 1217, 50, 60, 400 } },
        Case { "oneInTheRightMarginBack", parent, { 1219, 50, 60, 400 }, { 1217, 50, 60, 400 } },
        Case { "oneAtTheRightMarginNowhere", parent, { 1217, 50, 60, 400 }, { 1217, 50, 60, 400 } },
        Case { "oneInTheUpperRightCornerBackBoth", parent, { 1270, 700, 60, 400 },
            { 1217, 295, 60, 400 } },
        Case { "oneWiderThanItsParentFlushRight", parent, { 0, 50, 1400, 100 },
            { 1280 - 3 - 1400, 50, 1400, 100 } },
        Case { "oneTallerThanItsParentFlushWithTheTop", parent, { 100, 0, 60, 800 },
            { 100, 720 - 25 - 800, 60, 800 } },
        Case { "oneOfAParentElsewhereThere", { 320, 180, 1280, 720 }, { 300, 100, 60, 400 },
            { 343, 183, 60, 400 } },
        Case { "oneOfAParentLeftOfTheScreenThere", { -1280, -720, 1280, 720 }, { 10, 10, 60, 400 },
            { -63, -425, 60, 400 } }),
    caseName);

// Of a panel of 60 x 400 on a screen of 1280 x 800.

class ReachablePanel : public testing::Test
{
protected:
    static Rect shown(const Rect &panel, const Rect &parent)
    {
        return reachablePanel(panel, parent, { 0, 0, 1280, 800 });
    }
};

TEST_F(ReachablePanel, thatFitsItsParentStaysEvenOutOfTheScreen)
{
    EXPECT_EQ(
        shown({ 200, -300, 60, 400 }, { 100, -300, 640, 428 }), (Rect { 200, -300, 60, 400 }));
}

TEST_F(ReachablePanel, thatIsHigherThanItsParentHasRoomForComesUp)
{
    EXPECT_EQ(shown({ 200, -300, 60, 400 }, { 100, -300, 640, 427 }), (Rect { 200, 0, 60, 400 }));
    EXPECT_EQ(shown({ 200, -1, 60, 400 }, { 100, 100, 480, 270 }), (Rect { 200, 0, 60, 400 }));
}

TEST_F(ReachablePanel, comesDownAndInFromTheSides)
{
    EXPECT_EQ(shown({ 1260, 500, 60, 400 }, { 900, 600, 480, 270 }), (Rect { 1220, 400, 60, 400 }));
    EXPECT_EQ(shown({ -70, 100, 60, 400 }, { -90, 100, 480, 270 }), (Rect { 0, 100, 60, 400 }));
}

TEST_F(ReachablePanel, insideTheScreenStaysWhereItIs)
{
    EXPECT_EQ(shown({ 200, 20, 60, 400 }, { 100, 100, 480, 270 }), (Rect { 200, 20, 60, 400 }));
}

TEST_F(ReachablePanel, higherThanTheScreenKeepsItsLowerEnd)
{
    EXPECT_EQ(shown({ 200, -30, 60, 900 }, { 0, 0, 1280, 800 }), (Rect { 200, 0, 60, 900 }));
}

} // namespace penwick::test
