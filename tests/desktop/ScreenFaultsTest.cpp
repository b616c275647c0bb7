// SPDX-License-Identifier: MIT
// A screen that goes and comes back while a window stands on it.
#include "desktop/support/FaultFixture.h"

namespace penwick::desktop {

namespace {

constexpr QSize wholeDisplay { 2304, 1000 };
constexpr QRect first { 0, 0, 1280, 800 };
constexpr QRect second { 1280, 0, 1024, 768 };

class ScreenLost : public FaultTest, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    ScreenLost()
        : FaultTest(std::get<WindowManager>(GetParam()), wholeDisplay)
    {
        desktop().splitInto({ first, second });
    }

    [[nodiscard]] static const char *kind() { return std::get<const char *>(GetParam()); }

    /// Wherever the board went, its tool bar stands beside it as it did.
    void expectToolBarBeside()
    {
        expectPlacesKnown();
        EXPECT_TRUE(waitUntil([this] { return offsetOfToolBar() == m_offset; }))
            << testing::PrintToString(places());
        expectPlacesKnown();
    }
    void learnPlaces()
    {
        expectPlacesKnown();
        m_offset = offsetOfToolBar();
    }

private:
    [[nodiscard]] QPoint offsetOfToolBar()
    {
        const std::vector<QRect> now = places();
        return now.at(1).topLeft() - now.at(0).topLeft();
    }

    QPoint m_offset; // from the board's corner to the tool bar's
};

} // namespace

TEST_P(ScreenLost, leavesAWindowThatIsDrawnOnAndEnds)
{
    startKind(kind(), { "--screen", "1" });
    learnPlaces();
    expectInk();

    desktop().splitInto({ first });
    if (std::get<WindowManager>(GetParam())
        == WindowManager::Openbox) { // brings back windows from outside
        EXPECT_TRUE(waitUntil([this] { return places().front().intersects(first); }));
    }
    expectInk();
    expectToolBarBeside();

    desktop().splitInto({ first, second });
    expectInk();
    expectToolBarBeside();

    expectEndByTool();
}

TEST_P(ScreenLost, withoutAWindowOnItChangesNothing)
{
    startKind(kind());
    expectPlacesKnown();
    const std::vector<QRect> before = places();
    expectInk();

    desktop().splitInto({ first });
    expectInk();
    EXPECT_EQ(places(), before);

    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, ScreenLost,
    testing::Combine(testing::ValuesIn(eachManager()), testing::ValuesIn(allKinds())),
    managerAndKindName);

} // namespace penwick::desktop
