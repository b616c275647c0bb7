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

    void dragBy(WindowId window, int distance)
    {
        const QRect frame = desktop().windows().outerFrame(window);
        const QPoint title(frame.center().x(), frame.top() + 10);
        desktop().pointer().drag({ title, title + QPoint(distance, 0) });
        EXPECT_TRUE(waitUntil([&] {
            return desktop().windows().outerFrame(window) == frame.translated(distance, 0);
        })) << testing::PrintToString(desktop().windows().outerFrame(window));
    }

    /// Remembers how the tool bar looks with one pixel a point.
    void learnToolBar()
    {
        m_bar = toolBarWindow();
        const WindowState bar = toolBar();
        m_size = bar.frame.size();
        m_beforeEnd = bar.buttons.value(QStringLiteral("state")) - bar.frame.topLeft()
            - QPoint(m_size.width() / 4, 0); // beside its text
    }

    /// It shows its last button where that is with `scale` pixels a point.
    void expectWholeToolBar(int scale)
    {
        const auto frame = [this] { return desktop().windows().outerFrame(m_bar); };
        EXPECT_TRUE(waitUntil([&] { return frame().size() == m_size * scale; }));
        const auto color
            = [&] { return desktop().screen().pixel(frame().topLeft() + m_beforeEnd * scale); };
        EXPECT_TRUE(waitUntil([&] { return color().red() > 200 && color().green() < 120; }))
            << color().name().toStdString();
        // So does the program believe; its log may be later.
        EXPECT_TRUE(
            waitUntil([&] { return host().window(QStringLiteral("toolPanel")).frame == frame(); }));
    }

private:
    WindowId m_bar = 0;
    QSize m_size;
    QPoint m_beforeEnd; // from the tool bar's corner
};

} // namespace

TEST_P(ScaleChange, leavesAWindowOfTheSamePixelsThatIsDrawnOnAndItsToolBarWhole)
{
    startKind(std::get<const char *>(GetParam()), {}, { scales });
    const WindowId moved = window();
    learnToolBar();
    expectInk();

    dragBy(moved, fine.x());
    expectWholeToolBar(2);
    expectInk();

    dragBy(moved, -fine.x());
    expectWholeToolBar(1);
    expectInk();
    expectNothingSaid();
    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, ScaleChange,
    testing::Combine(testing::Values(WindowManager::Openbox, WindowManager::Xfwm4),
        testing::Values("whiteboard", "imageAnnotation")),
    managerAndKindName);

class LayerOfAnotherScale : public FaultTest, public testing::WithParamInterface<WindowManager>
{
protected:
    LayerOfAnotherScale()
        : FaultTest(GetParam(), { 4800, 1800 })
    { }
};

TEST_P(LayerOfAnotherScale, coversItsScreenExactly)
{
    desktop().splitInto({ { 0, 0, 1600, 900 }, { 1600, 0, 3200, 1800 } });
    startKind("annotation", { "--screen", "1" }, { "QT_SCREEN_SCALE_FACTORS=1;2" });

    EXPECT_EQ(desktop().windows().outerFrame(window()), QRect(1600, 0, 3200, 1800));
    EXPECT_EQ(toolBar().frame.size(), QSize(104, 704));
    expectInk();
    expectEndByTool();
}

INSTANTIATE_TEST_SUITE_P(Managers, LayerOfAnotherScale,
    testing::Values(WindowManager::Openbox, WindowManager::Xfwm4), managerName);

} // namespace penwick::desktop
