// SPDX-License-Identifier: MIT
// Where a window stands that has just been opened, again and again: a window manager is told and
// tells of frames in an order that is not the same each time.
#include "desktop/support/FaultFixture.h"

namespace penwick::desktop {

namespace {

class Opening : public FaultTest, public testing::WithParamInterface<ManagerAndKind>
{
protected:
    /// Longer than the component waits for a window manager that does not grant what it asked.
    static constexpr std::chrono::milliseconds negotiation { 700 };

    Opening()
        : FaultTest(std::get<WindowManager>(GetParam()))
    { }

    [[nodiscard]] static const char *kind() { return std::get<const char *>(GetParam()); }

    /// On a screen of 1280 by 800, from the top left, title bar included.
    [[nodiscard]] static QRect askedFrame()
    {
        if (kind() == std::string("annotation"))
            return { 0, 0, 1280, 800 };
        if (kind() == std::string("imageAnnotation"))
            return { 213, 267, 600, 400 };
        return { 213, 187, 853, 480 };
    }

    /// The tool bar stands so far inside, in the middle of the height.
    [[nodiscard]] static QPoint toolBarPlace(QSize bar)
    {
        const QRect frame = askedFrame();
        return { frame.left() + 20, frame.top() + (frame.height() - bar.height()) / 2 };
    }
};

} // namespace

TEST_P(Opening, tenTimesEndsAtTheAskedFrameEachTime)
{
    for (int opening = 1; opening <= 10; ++opening) {
        SCOPED_TRACE(opening);
        startKind(kind());
        const WindowId board = window();
        const Windows &windows = desktop().windows();
        const QSize bar = windows.outerFrame(toolBarWindow()).size();
        const auto isAsAsked = [&] {
            return windows.outerFrame(board) == askedFrame()
                && windows.outerFrame(toolBarWindow()).topLeft() == toolBarPlace(bar)
                && host().window(QStringLiteral("drawing")).frame == askedFrame();
        };
        EXPECT_TRUE(waitUntil(isAsAsked)) << testing::PrintToString(places());

        // It stays so: what was asked too early is not answered later.
        EXPECT_FALSE(waitUntil([&] { return !isAsAsked(); }, negotiation))
            << testing::PrintToString(places());
        expectInk();

        host().steer(QStringLiteral("close"));
        EXPECT_EQ(host().waitForExit(), 0);
    }
}

INSTANTIATE_TEST_SUITE_P(ManagersAndKinds, Opening,
    testing::Combine(testing::ValuesIn(eachManager()), testing::ValuesIn(allKinds())),
    managerAndKindName);

} // namespace penwick::desktop
