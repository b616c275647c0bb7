// SPDX-License-Identifier: MIT
// A screen that goes and comes back while a window stands on it.
#include "desktop/support/FaultFixture.h"

namespace penwick::desktop {

namespace {

constexpr QSize wholeDisplay { 2304, 1000 };
constexpr QRect first { 0, 0, 1280, 800 };
constexpr QRect second { 1280, 0, 1024, 768 };

class ScreenLost : public FaultOfEachKind
{
protected:
    ScreenLost()
        : FaultOfEachKind(WindowManager::Openbox, wholeDisplay)
    {
        desktop().splitInto({ first, second });
    }
};

} // namespace

TEST_P(ScreenLost, leavesAWindowThatIsDrawnOnAndEnds)
{
    startKind(GetParam(), { "--screen", "1" });
    expectInk();

    desktop().splitInto({ first });
    expectInk();

    desktop().splitInto({ first, second });
    expectInk();

    expectEndByTool();
}

TEST_P(ScreenLost, thatIsAnotherThanTheWindowsMattersNothing)
{
    startKind(GetParam());
    expectInk();

    desktop().splitInto({ first });
    expectInk();

    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(Kinds, ScreenLost, testing::ValuesIn(allKinds()), kindName);

} // namespace penwick::desktop
