// SPDX-License-Identifier: MIT
// A desktop whose window manager or compositing manager is not there, or goes and comes back.
#include "desktop/support/FaultFixture.h"
#include "desktop/support/OtherProgram.h"

namespace penwick::desktop {

namespace {

constexpr QColor orange { 230, 120, 20 };
constexpr QRect otherArea { 700, 300, 300, 200 };

class NoWindowManager : public FaultOfEachKind
{
protected:
    NoWindowManager()
        : FaultOfEachKind(WindowManager::None)
    { }
};

class WindowManagerRestart : public FaultOfEachKind
{ };

class CompositorLost : public FaultTest
{
protected:
    [[nodiscard]] bool comesToShow(const QColor &color)
    {
        return waitUntil([&] {
            const QColor seen = desktop().screen().pixel(otherArea.center());
            return std::abs(seen.red() - color.red()) <= 2
                && std::abs(seen.green() - color.green()) <= 2
                && std::abs(seen.blue() - color.blue()) <= 2;
        });
    }
};

} // namespace

TEST_P(NoWindowManager, windowIsDrawnOnAndEnds)
{
    startKind(GetParam());

    expectInk();

    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(Kinds, NoWindowManager, testing::ValuesIn(allKinds()), kindName);

TEST_P(WindowManagerRestart, leavesAWindowThatIsDrawnOnAndEnds)
{
    startKind(GetParam());
    expectInk();

    desktop().endWindowManager();
    expectInk();

    desktop().startWindowManager();
    expectInk();
    expectEndByTool(); // so the tool bar is there, and above
}

INSTANTIATE_TEST_SUITE_P(Kinds, WindowManagerRestart, testing::ValuesIn(allKinds()), kindName);

TEST_F(CompositorLost, underAnOpenOverlayItIsBlackMeanwhileAndShowsWhatIsBelowAgainAfterwards)
{
    desktop().startCompositor();
    OtherProgram other(desktop(), otherArea, orange);
    startKind("annotation");
    ASSERT_TRUE(comesToShow(orange));
    expectInk();

    desktop().endCompositor();
    EXPECT_TRUE(comesToShow(Qt::black));
    expectInk();

    desktop().startCompositor();
    EXPECT_TRUE(comesToShow(orange));
    expectInk();
    expectNothingSaid();
    expectEndByTool();
}

TEST_F(CompositorLost, andFoundAgainDoesNotDisturbABoard)
{
    desktop().startCompositor();
    startKind("whiteboard");
    expectInk();

    desktop().endCompositor();
    expectInk();

    desktop().startCompositor();
    expectInk();
    expectNothingSaid();
    expectEndByTool();
}

TEST_F(CompositorLost, thatComesAfterTheOverlayLeavesItsPictureOfWhatWasBelow)
{
    OtherProgram other(desktop(), otherArea, orange);
    startKind("annotation");
    ASSERT_TRUE(comesToShow(orange));

    desktop().startCompositor();

    expectInk();
    EXPECT_TRUE(comesToShow(orange));
    expectEndByTool();
}

} // namespace penwick::desktop
