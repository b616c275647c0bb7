// SPDX-License-Identifier: MIT
// Windows that the user moves to a screen of another scale, and back.
#include "desktop/support/FaultFixture.h"

namespace penwick::desktop {

namespace {

class ScaleChange : public FaultTest, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    static constexpr QSize wholeDisplay { 4800, 1800 };
    static constexpr QRect coarse { 0, 0, 1600, 900 };
    static constexpr QRect fine { 1600, 0, 3200, 1800 };
    static constexpr const char *scales = "QT_SCREEN_SCALE_FACTORS=1;2";

    ScaleChange()
        : FaultTest(std::get<WindowManager>(GetParam()), wholeDisplay)
    {
        desktop().splitInto({ coarse, fine });
    }

    void dragBy(int distance)
    {
        const QRect wanted = frame().translated(distance, 0);
        const QPoint title(frame().center().x(), frame().top() + 10);
        pull(title, { distance, 0 });
        EXPECT_TRUE(waitUntil([&] { return isTheSame(frame(), wanted); }))
            << testing::PrintToString(frame());
    }

    /// Content of an odd number of pixels is no whole number of points where a point is two of
    /// them: it may then be a pixel smaller.
    [[nodiscard]] bool isTheSame(const QRect &one, const QRect &wanted)
    {
        const QSize lost(m_content.width() % 2, m_content.height() % 2);
        return one == wanted || one == QRect(wanted.topLeft(), wanted.size() - lost);
    }

    [[nodiscard]] QRect frame() { return desktop().windows().outerFrame(m_window); }

    /// Remembers the window, and how its tool bar looks with one pixel a point.
    void learnWindows()
    {
        m_window = window();
        m_bar = toolBarWindow();
        m_content = canvas().size();
        const WindowState bar = toolBar();
        m_size = bar.frame.size();
        m_beforeEnd = bar.buttons.value(QStringLiteral("state")) - bar.frame.topLeft()
            - QPoint(m_size.width() / 4, 0); // beside its text
    }

    /// The tool bar shows its last button where it has to be with `scale` pixels a point.
    void expectWholeToolBar(int scale)
    {
        constexpr int inset = 20; // points
        const auto bar = [this] { return desktop().windows().outerFrame(m_bar); };
        EXPECT_TRUE(waitUntil([&] { return bar().size() == m_size * scale; }));
        EXPECT_TRUE(waitUntil([&] { // a point or two are lost where it crosses over
            return std::abs(bar().left() - frame().left() - inset * scale) <= 2 * scale;
        })) << bar().left() - frame().left();
        const auto color
            = [&] { return desktop().screen().pixel(bar().topLeft() + m_beforeEnd * scale); };
        EXPECT_TRUE(waitUntil([&] { return color().red() > 200 && color().green() < 120; }))
            << color().name().toStdString();
        // The program believes so too; its log may be later.
        EXPECT_TRUE(
            waitUntil([&] { return host().window(QStringLiteral("toolPanel")).frame == bar(); }));
    }

private:
    WindowId m_window = 0;
    WindowId m_bar = 0;
    QSize m_size;
    QSize m_content; // when it was opened
    QPoint m_beforeEnd; // from the tool bar's corner
};

} // namespace

TEST_P(ScaleChange, leavesAWindowOfTheSamePixelsThatIsDrawnOnAndItsToolBarWhole)
{
    startKind(std::get<const char *>(GetParam()), {}, { scales });
    learnWindows();
    const QRect before = frame();
    expectInk();

    dragBy(fine.x());
    expectWholeToolBar(2);
    expectInk();
    EXPECT_TRUE(isTheSame(frame(), before.translated(fine.x(), 0)));

    dragBy(-fine.x());
    expectWholeToolBar(1);
    expectInk();
    EXPECT_TRUE(isTheSame(frame(), before));
    expectNothingSaid();
    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, ScaleChange,
    testing::Combine(
        testing::ValuesIn(eachManager()), testing::Values("whiteboard", "imageAnnotation")),
    managerAndKindName);

class OpenedAtAnotherScale : public FaultTest, public testing::WithParamInterface<WindowManager>
{
protected:
    OpenedAtAnotherScale()
        : FaultTest(GetParam(), { 4800, 1800 })
    {
        desktop().splitInto({ { 0, 0, 1600, 900 }, { 1600, 0, 3200, 1800 } });
    }

    void startOnFineScreen(const std::string &kind)
    {
        startKind(kind, { "--screen", "1" }, { "QT_SCREEN_SCALE_FACTORS=1;2" });
    }

    /// Two points, which are two pixels each, may be missing: the title bar's borders are half a
    /// point.
    void expectFrame(const QRect &wanted)
    {
        const WindowId board = desktop().windows().ofProcess(host().processId()).front();
        const auto frame = [&] { return desktop().windows().outerFrame(board); };
        const auto isNear = [](int one, int other) { return std::abs(one - other) <= 4; };
        // Waits until the frame has rested for longer than the answer to a user's pull takes.
        QRect seen;
        do {
            seen = frame();
        } while (waitUntil([&] { return frame() != seen; }, rest));
        EXPECT_TRUE(isNear(seen.left(), wanted.left()) && isNear(seen.top(), wanted.top())
            && isNear(seen.width(), wanted.width()) && isNear(seen.height(), wanted.height()))
            << testing::PrintToString(seen);
    }

    static constexpr std::chrono::milliseconds rest { 1000 };
};

TEST_P(OpenedAtAnotherScale, aLayerCoversItsScreenExactly)
{
    startOnFineScreen("annotation");

    EXPECT_EQ(desktop().windows().outerFrame(window()), QRect(1600, 0, 3200, 1800));
    EXPECT_EQ(toolBar().frame.size(), QSize(104, 704));
    expectInk();
    expectEndByTool();
}

TEST_P(OpenedAtAnotherScale, aBoardHasTwoThirdsOfItsScreen)
{
    startOnFineScreen("whiteboard");

    expectFrame({ 2133, 300, 2134, 1200 });
    EXPECT_EQ(toolBar().frame.size(), QSize(104, 704));
}

TEST_P(OpenedAtAnotherScale, anImageHasAPointForEachOfItsPixels)
{
    startOnFineScreen("imageAnnotation");

    expectFrame({ 2133, 700, 1200, 800 });
    EXPECT_EQ(toolBar().frame.size(), QSize(104, 704));
}

TEST_P(OpenedAtAnotherScale, aBoardStaysWhereItIsOnADesktopOfOneScale)
{
    start({}, HostProgram::AsShipped, { "QT_SCALE_FACTOR=2" });

    expectFrame({ 267, 150, 1066, 600 });
}

INSTANTIATE_TEST_SUITE_P(
    Managers, OpenedAtAnotherScale, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
