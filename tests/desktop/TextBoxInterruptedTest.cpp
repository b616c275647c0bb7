// SPDX-License-Identifier: MIT
// What comes between a writer and the box, and ends nothing.
#include "desktop/support/TextBoxFixture.h"

namespace penwick::desktop {

namespace {

/// A box that is edited; with text in it or without any.
class TextBoxInterrupted : public TextBoxTest, public testing::WithParamInterface<const char *>
{
protected:
    TextBoxInterrupted()
    {
        openForText();
        makeBox({ 300, 200 });
        if (*GetParam())
            type(m_corner, GetParam());
    }

    /// Whether the box is edited still, and gets the keys.
    void expectItGoesOn()
    {
        EXPECT_TRUE(comesToBeEdited(m_corner));
        EXPECT_TRUE(deleteButtonComesToBe(m_corner, deleteMark));
        type(m_corner, "mm");
        click(farAway);
        EXPECT_TRUE(comesToBePlaced(m_corner));
    }

    const QPoint m_corner = boxOf({ 300, 200 });
};

} // namespace

TEST_P(TextBoxInterrupted, byItsOwnContextMenu)
{
    const QRect below(m_corner + QPoint(110, 60), QSize(60, 100));

    click(m_corner + QPoint(100, 15), MouseButton::Right);
    ASSERT_TRUE(waitUntil([&] { return darkest(pictureOf(below)) < 255; })) << "no menu";
    desktop().keyboard().press("Escape");
    ASSERT_TRUE(waitUntil([&] { return darkest(pictureOf(below)) == 255; })) << "the menu stays";

    expectItGoesOn();
}

TEST_P(TextBoxInterrupted, byAnotherApplication)
{
    const WindowId board = window();
    {
        HostProcess other(desktop());
        other.waitForWindow(QStringLiteral("drawing"));
        ASSERT_TRUE(waitUntil([&] { return desktop().windows().active() != board; }));
        desktop().windows().activate(board);
        ASSERT_TRUE(waitUntil([&] { return desktop().windows().active() == board; }));
    }

    expectItGoesOn();
}

TEST_P(TextBoxInterrupted, byMinimisingTheWindow)
{
    const WindowId board = window();
    const WindowId bar = toolBarWindow();

    desktop().windows().minimise(board);
    ASSERT_TRUE(waitUntil(
        [&] { return !desktop().windows().isShown(board) && !desktop().windows().isShown(bar); }));
    desktop().windows().activate(board);
    ASSERT_TRUE(waitUntil([&] {
        return desktop().windows().isShown(board) && desktop().windows().active() == board;
    }));

    expectItGoesOn();
}

INSTANTIATE_TEST_SUITE_P(WithText, TextBoxInterrupted, testing::Values("", "Hi"),
    [](const auto &text) { return *text.param ? "written" : "empty"; });

} // namespace penwick::desktop
