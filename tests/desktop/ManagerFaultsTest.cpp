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

class WindowManagerRestart : public FaultTest, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    WindowManagerRestart()
        : FaultTest(std::get<WindowManager>(GetParam()))
    { }

    /// Where the contents of the host's windows are, as the server has them.
    [[nodiscard]] std::vector<QRect> contents()
    {
        std::vector<QRect> contents;
        for (const WindowId window : desktop().windows().ofProcess(host().processId()))
            contents.push_back(desktop().windows().clientArea(window));
        return contents;
    }

    /// Watches for longer than the component waits for a window manager's answer.
    void expectFrameStays(const QRect &frame)
    {
        constexpr std::chrono::milliseconds longerThanPatience { 500 };
        EXPECT_FALSE(waitUntil([&] { return host().frame() != frame; }, longerThanPatience))
            << testing::PrintToString(host().frame());
    }
};

class SilentManager : public FaultOfEachKind
{
protected:
    SilentManager()
        : FaultOfEachKind(WindowManager::Silent)
    { }
};

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

TEST_P(WindowManagerRestart, leavesEverythingInItsPlace)
{
    startKind(std::get<const char *>(GetParam()));
    expectInk();
    expectPlacesKnown();
    const std::vector<QRect> placesBefore = places();
    const std::vector<QRect> contentsBefore = contents();
    const QRect frameBefore = host().frame();

    desktop().endWindowManager();
    expectFrameStays(frameBefore);
    expectInk();
    EXPECT_EQ(contents(), contentsBefore);

    desktop().startWindowManager();
    expectFrameStays(frameBefore);
    EXPECT_TRUE(waitUntil([&] { return places() == placesBefore; }));
    expectInk();
    EXPECT_EQ(places(), placesBefore);
    EXPECT_EQ(contents(), contentsBefore);
    expectEndByTool(); // so the tool bar is there, and above
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, WindowManagerRestart,
    testing::Combine(testing::ValuesIn(eachManager()), testing::ValuesIn(allKinds())),
    managerAndKindName);

// The toolkit believes that it was granted what it has asked for.
TEST_P(SilentManager, whatIsOnTheScreenIsToldInTheEnd)
{
    startKind(GetParam());
    expectPlacesKnown();
    const QRect before = toolBar().frame;
    const auto told = [this] { return host().window(QStringLiteral("toolPanel")).frame; };

    const QPoint handle(before.center().x(), before.top() + 8);
    desktop().pointer().drag({ handle, handle + QPoint(100, 60) });

    EXPECT_TRUE(waitUntil([&] { return told() != before; }));
    EXPECT_TRUE(waitUntil([&] { return told() == before; }));
    EXPECT_EQ(toolBar().frame, before);
    expectNothingSaid();
}

INSTANTIATE_TEST_SUITE_P(
    Boards, SilentManager, testing::Values("whiteboard", "imageAnnotation"), kindName);

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
