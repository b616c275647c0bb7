// SPDX-License-Identifier: MIT
// Writing on the board: a box is made, written in and left.
#include "desktop/support/TextBoxFixture.h"

namespace penwick::desktop {

namespace {

using TextBoxEditing = TextBoxTest;

class TextBoxEndingKey : public TextBoxTest, public testing::WithParamInterface<const char *>
{ };

class TextBoxOtherButton : public TextBoxTest, public testing::WithParamInterface<MouseButton>
{ };

constexpr QPoint place { 300, 200 };
constexpr QPoint elsewhere { 600, 300 };

/// Where the menu of a box covers the board.
QRect belowOf(QPoint corner)
{
    return { corner + QPoint(160, 60), QSize(60, 100) };
}

} // namespace

TEST_F(TextBoxEditing, clickMakesABoxOf200By30WhoseOriginIs24BelowTheClick)
{
    openForText();

    const QPoint corner = makeBox(place);

    EXPECT_EQ(corner + QPoint(0, newBoxSize.height()), place + QPoint(0, 24));
    // The dashed border lies inside the bounds: one point from the left and top edges, at the
    // right and bottom ones.
    EXPECT_EQ(extentOf(editBorder, QRect(corner, newBoxSize).adjusted(-9, -9, 0, 9)),
        QRect(corner + QPoint(1, 1), newBoxSize - QSize(1, 1)));
    EXPECT_TRUE(deleteButtonComesToBe(corner, deleteMark));
    const QImage hint = pictureOf({ corner + QPoint(10, 4), QSize(180, 22) });
    EXPECT_NEAR(darkest(hint), 148, 10);
}

TEST_F(TextBoxEditing, typedTextAppearsInPlaceOfThePlaceholder)
{
    openForText();
    const QPoint corner = makeBox(place);

    type(corner, "Hi");

    const QRect end(corner + QPoint(100, 4), QSize(90, 22)); // of the placeholder
    EXPECT_EQ(darkest(pictureOf(end)), 255);
    EXPECT_TRUE(isEdited(corner));
}

TEST_F(TextBoxEditing, clickElsewherePlacesTheBoxAndTheNextOneMakesOne)
{
    openForText();
    const QPoint corner = makeBox(place);
    type(corner, "Hi");

    click(elsewhere);
    EXPECT_TRUE(comesToBePlaced(corner));
    EXPECT_TRUE(deleteButtonComesToBe(corner, Qt::white));
    EXPECT_EQ(darkest(pictureOf({ boxOf(elsewhere), newBoxSize })), 255);

    click(elsewhere);
    EXPECT_TRUE(comesToBeEdited(boxOf(elsewhere)));
}

TEST_F(TextBoxEditing, emptyBoxVanishesWhenItIsLeft)
{
    openForText();
    const QPoint corner = makeBox(place);

    click(elsewhere);

    EXPECT_TRUE(vanishes(corner));
    EXPECT_TRUE(deleteButtonComesToBe(corner, Qt::white));
    EXPECT_EQ(darkest(pictureOf(QRect(corner, newBoxSize).adjusted(-5, -25, 30, 10))), 255);
}

TEST_F(TextBoxEditing, emptyBoxThatUndoBroughtBackCanBeEditedAndLeftAgain)
{
    openForText();
    const QPoint corner = makeBox(place);
    click(elsewhere);
    ASSERT_TRUE(vanishes(corner));

    host().selectTool(QStringLiteral("undo"));
    ASSERT_TRUE(comesToBePlaced(corner));
    doubleClick(corner + QPoint(60, 15));
    ASSERT_TRUE(comesToBeEdited(corner));
    click(elsewhere);
    EXPECT_TRUE(vanishes(corner));

    host().selectTool(QStringLiteral("undo"));
    ASSERT_TRUE(comesToBePlaced(corner));
    doubleClick(corner + QPoint(60, 15));
    ASSERT_TRUE(comesToBeEdited(corner));
    type(corner, "Hi");
    click(elsewhere);
    EXPECT_TRUE(comesToBePlaced(corner));
    EXPECT_FALSE(inked(corner).isNull());
}

TEST_F(TextBoxEditing, backspaceEditsTheText)
{
    openForText();
    const QPoint corner = makeBox(place);
    type(corner, "m");
    const int one = inked(corner).width();
    type(corner, "mm");

    desktop().keyboard().press("BackSpace");
    desktop().keyboard().press("BackSpace");

    EXPECT_TRUE(waitUntil([&] { return inked(corner).width() <= one; }));
    EXPECT_TRUE(isEdited(corner));
}

TEST_P(TextBoxEndingKey, placesTheBoxSoThatTheNextClickMakesANewOne)
{
    openForText();
    const QPoint corner = makeBox(place);
    type(corner, "Hi");

    desktop().keyboard().press(GetParam());

    EXPECT_TRUE(comesToBePlaced(corner));
    click(elsewhere);
    EXPECT_TRUE(comesToBeEdited(boxOf(elsewhere)));
}

INSTANTIATE_TEST_SUITE_P(Keys, TextBoxEndingKey, testing::Values("Return", "Tab", "Escape"),
    [](const auto &key) { return std::string(key.param); });

TEST_P(TextBoxOtherButton, inABoxDrawsNothingAndEndsNothing)
{
    openForText();
    const QPoint corner = makeBox(place);
    type(corner, "Hi");
    host().selectTool(QStringLiteral("brush"));

    drag({ corner + QPoint(150, 10), corner + QPoint(150, -60) }, GetParam());
    if (GetParam() == MouseButton::Right) {
        ASSERT_TRUE(waitUntil([&] { return darkest(pictureOf(belowOf(corner))) < 255; }));
        desktop().keyboard().press("Escape"); // closes the menu, ends no editing
        ASSERT_TRUE(waitUntil([&] { return darkest(pictureOf(belowOf(corner))) == 255; }));
    }
    type(corner, "mm");

    EXPECT_TRUE(isEdited(corner));
    EXPECT_EQ(darkest(pictureOf({ corner + QPoint(100, -80), QSize(90, 55) })), 255);
    EXPECT_EQ(host().notifications().size(), 1U); // undo of the box
}

INSTANTIATE_TEST_SUITE_P(Buttons, TextBoxOtherButton,
    testing::Values(MouseButton::Middle, MouseButton::Right),
    [](const auto &button) { return button.param == MouseButton::Middle ? "middle" : "right"; });

TEST_F(TextBoxEditing, longestWordThatABoxTakesLeavesTheBoardUsable)
{
    openForText();
    const QPoint corner = makeBox(place);
    type(corner, "mmmmmmmmmm");
    Keyboard &keyboard = desktop().keyboard();
    for (int count = 10; count < 10'000; count *= 2) {
        keyboard.pressWith("Control_L", "a");
        keyboard.pressWith("Control_L", "c");
        keyboard.press("Right");
        keyboard.pressWith("Control_L", "v");
    }

    keyboard.press("Return");
    drag({ { 700, 100 }, { 700, 300 } }); // the box, which has covered all of the board

    const QRect topBorder(QPoint(600, 200), QSize(50, 3));
    EXPECT_TRUE(waitUntil(
        [&] { return extentOf(placedBorder, topBorder.adjusted(0, -10, 0, 2)) == topBorder; }));
    host().selectTool(QStringLiteral("brush"));
    drag({ { 300, 60 }, { 500, 60 } });
    waitForLevel({ 498, 60 }, inkOnWhite);
    EXPECT_EQ(host().errorOutput(), QString());
}

TEST_F(TextBoxEditing, boxClickedInACornerIsSeenWholeFromTheFirstLetterOn)
{
    openForText();
    const QSize board = canvas().size();
    const QPoint clicked(board.width() - 30, board.height() - 10);
    click(clicked);
    ASSERT_TRUE(comesToBeEdited(boxOf(clicked)));

    desktop().keyboard().type("a");

    // As high as its line, at the bottom, with room for the delete button beside it.
    const int left = board.width() - newBoxSize.width() - 21;
    const QRect area(QPoint(left - 5, board.height() - 60), QSize(240, 60));
    EXPECT_TRUE(waitUntil([&] { return extentOf(editBorder, area).left() == left + 1; }));
    const QRect border = extentOf(editBorder, area);
    EXPECT_EQ(border.right(), left + newBoxSize.width() - 1);
    const QPoint corner(left, border.top() - 1);
    EXPECT_TRUE(deleteButtonComesToBe(corner, deleteMark));
}

} // namespace penwick::desktop
