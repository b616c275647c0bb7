// SPDX-License-Identifier: MIT
// Where a white board stands: two thirds of the screen's width, 16 to 9, a sixth of the screen
// from its left and bottom edges, title bar included.
#include "desktop/support/BoardFixture.h"

#include <tuple>

namespace penwick::desktop {

namespace {

struct Case
{
    const char *name;
    QSize screen;
    QRect frame; ///< from the top left
};

using ManagerAndCase = std::tuple<WindowManager, Case>;

class WhiteboardFrame : public testing::TestWithParam<ManagerAndCase>
{ };

void PrintTo(const Case &testCase, std::ostream *stream)
{
    *stream << testCase.name;
}

std::string caseName(const testing::TestParamInfo<ManagerAndCase> &info)
{
    const auto &[manager, testCase] = info.param;
    return traitsOf(manager).name + '_' + testCase.name;
}

} // namespace

TEST_P(WhiteboardFrame, isTheOuterFrame)
{
    const auto &[manager, testCase] = GetParam();
    Desktop desktop(manager, testCase.screen);
    HostProcess host(desktop);

    const QRect logged = host.waitForWindow(QStringLiteral("drawing")).frame;

    EXPECT_EQ(logged, testCase.frame);
    std::vector<WindowId> windows;
    ASSERT_TRUE(waitUntil([&] {
        windows = desktop.windows().ofProcess(host.processId());
        return !windows.empty();
    }));
    EXPECT_EQ(desktop.windows().outerFrame(windows.front()), testCase.frame);
}

// A third of 1280 is no whole number of pixels: there the corner and the size are each the nearest.
INSTANTIATE_TEST_SUITE_P(Desktops, WhiteboardFrame,
    testing::Combine(testing::ValuesIn(eachManager()),
        testing::Values(Case { "wide", { 1280, 800 }, { 213, 187, 853, 480 } },
            Case { "large", { 1920, 1080 }, { 320, 180, 1280, 720 } })),
    caseName);

} // namespace penwick::desktop
