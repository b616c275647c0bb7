// SPDX-License-Identifier: MIT
// Where a white board stands: two thirds of the screen's width, 16 to 9, a sixth of the screen
// from its left and bottom edges, title bar included.
#include "desktop/support/BoardFixture.h"

namespace penwick::desktop {

namespace {

struct Case
{
    const char *name;
    WindowManager windowManager;
    QSize screen;
    QRect frame; ///< from the top left
};

class WhiteboardFrame : public testing::TestWithParam<Case>
{ };

void PrintTo(const Case &testCase, std::ostream *stream)
{
    *stream << testCase.name;
}

std::string caseName(const testing::TestParamInfo<Case> &testCase)
{
    return testCase.param.name;
}

} // namespace

TEST_P(WhiteboardFrame, isTheOuterFrame)
{
    Desktop desktop(GetParam().windowManager, GetParam().screen);
    HostProcess host(desktop);

    const QRect logged = host.waitForWindow(QStringLiteral("drawing")).frame;

    EXPECT_EQ(logged, GetParam().frame);
    std::vector<WindowId> windows;
    ASSERT_TRUE(waitUntil([&] {
        windows = desktop.windows().ofProcess(host.processId());
        return !windows.empty();
    }));
    EXPECT_EQ(desktop.windows().outerFrame(windows.front()), GetParam().frame);
}

// A third of 1280 is no whole number of pixels: there the corner and the size are each the nearest.
INSTANTIATE_TEST_SUITE_P(Desktops, WhiteboardFrame,
    testing::Values(
        Case { "openboxWide", WindowManager::Openbox, { 1280, 800 }, { 213, 187, 853, 480 } },
        Case { "xfwm4Wide", WindowManager::Xfwm4, { 1280, 800 }, { 213, 187, 853, 480 } },
        Case { "openboxLarge", WindowManager::Openbox, { 1920, 1080 }, { 320, 180, 1280, 720 } },
        Case { "xfwm4Large", WindowManager::Xfwm4, { 1920, 1080 }, { 320, 180, 1280, 720 } }),
    caseName);

} // namespace penwick::desktop
