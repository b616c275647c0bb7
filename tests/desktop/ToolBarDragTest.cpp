// SPDX-License-Identifier: MIT
// The tool bar dragged by its handle: it glides back inside its board.
// The board is 853.33 by 480, title bar included; the tool bar 52 by 352.
#include "desktop/support/ToolBarFixture.h"

namespace penwick::desktop {

namespace {

struct Way
{
    const char *name;
    QPoint way;
    QPoint comesTo; ///< from the board's upper left corner
};

class ToolBarDrag : public ToolBarTest, public testing::WithParamInterface<Way>
{ };

std::string wayName(const testing::TestParamInfo<Way> &way)
{
    return way.param.name;
}

} // namespace

TEST_P(ToolBarDrag, comesToStand)
{
    open();

    dragBar(GetParam().way);

    EXPECT_TRUE(comesToStandAt(GetParam().comesTo));
    press("eraser");
    EXPECT_TRUE(turns("eraser", selected));
}

INSTANTIATE_TEST_SUITE_P(Ways, ToolBarDrag,
    testing::Values(Way { "inside", { 200, 10 }, { 220, 74 } },
        Way { "pastTheLeftEdge", { -100, 0 }, { 23, 64 } },
        Way { "pastTheRightEdge", { 900, 0 }, { 798, 64 } },
        Way { "pastTheUpperEdge", { 100, -150 }, { 120, 25 } },
        Way { "pastTheLowerEdge", { 100, 170 }, { 120, 125 } },
        Way { "pastTheLowerRightCorner", { 900, 170 }, { 798, 125 } }),
    wayName);

} // namespace penwick::desktop
