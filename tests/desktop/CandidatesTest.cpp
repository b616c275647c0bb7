// SPDX-License-Identifier: MIT
// Where the list stands that an input method shows of what may be meant: beside the caret.
#include "desktop/support/InputMethodFixture.h"
#include "desktop/support/OtherProgram.h"

#include <cstdlib>

namespace penwick::desktop {

namespace {

class CandidatesTest : public InputMethodTest
{
protected:
    void dragBoard()
    {
        const QPoint before = canvas().topLeft();
        const QPoint title = before + QPoint(400, -10);
        desktop().pointer().drag({ title, title + QPoint(40, 25), title + QPoint(80, 50) });
        require([&] { return canvas().topLeft() != before; }, "the board to move");
    }

    /// Whether the list comes to stand right above or below the caret that it is for.
    testing::AssertionResult comeToStandByTheCaret()
    {
        constexpr int near = 12;
        // ibus leaves it where the caret was as it came, at the end of what was composed.
        constexpr int composed = 80;
        QRect list;
        QRect caret;
        const bool came = waitUntil([&] {
            list = candidates();
            caret = host().writing().caret;
            const bool isBelow = std::abs(list.top() - caret.bottom()) <= near;
            const bool isAbove = std::abs(list.bottom() - caret.top()) <= near;
            const int right = list.left() - caret.left();
            return (isBelow || isAbove) && right >= -near && right <= composed;
        });
        return came ? testing::AssertionSuccess()
                    : testing::AssertionFailure()
                << "the list stands at " << list.x() << ", " << list.y() << " to " << list.bottom()
                << ", the caret at " << caret.x() << ", " << caret.y() << " to " << caret.bottom();
    }
};

} // namespace

TEST_P(CandidatesTest, standBesideTheCaretOfANewBox)
{
    const QPoint corner = makeBoxToCompose();
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));

    askForCandidates();
    keepPicture("new");

    EXPECT_EQ(host().writing().caret.topLeft(), onScreen(corner) + QPoint(5, 6));
    EXPECT_TRUE(comeToStandByTheCaret());
}

TEST_P(CandidatesTest, standBesideTheCaretOfABoxThatWasDragged)
{
    const QPoint corner = makeBoxToCompose();
    type("a");
    press("Return");
    ASSERT_TRUE(comesToHold("あ", ""));
    click(elsewhere);
    ASSERT_TRUE(comesToBePlaced(corner));
    const QPoint grip(60, 15);
    const QPoint way(120, -60);
    drag({ corner + grip, corner + grip + way / 2, corner + grip + way });
    ASSERT_TRUE(comesToBePlaced(corner + way));

    editAtTheBeginning(corner + way);
    type("kanji");
    ASSERT_TRUE(comesToHold("あ", "かんじ"));
    askForCandidates();

    keepPicture("dragged");
    EXPECT_TRUE(
        QRect(onScreen(corner + way), newBoxSize + QSize(0, 10)).contains(host().writing().caret));
    EXPECT_TRUE(comeToStandByTheCaret());
}

TEST_P(CandidatesTest, standBesideTheCaretOfABoxThatMovedAwayFromAnEdge)
{
    makeBoxToCompose({ 750, 150 });
    for (int word = 0; word < 2; ++word) {
        type("sakuramomo");
        press("Return");
    }
    type("kanji");
    ASSERT_TRUE(comesToHold("さくらももさくらもも", "かんじ"));

    askForCandidates();
    keepPicture("edge");

    EXPECT_TRUE(canvas().contains(host().writing().caret));
    EXPECT_TRUE(comeToStandByTheCaret());
}

TEST_P(CandidatesTest, standBesideTheCaretOfATextThatIsScrolled)
{
    makeBoxToCompose();
    for (int line = 0; line < 24; ++line)
        desktop().keyboard().pressWith("Shift_L", "Return");
    type("kanji");
    ASSERT_TRUE(comesToHold("\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n", "かんじ"));

    askForCandidates();
    keepPicture("scrolled");

    EXPECT_TRUE(canvas().contains(host().writing().caret));
    EXPECT_TRUE(comeToStandByTheCaret());
}

TEST_P(CandidatesTest, standBesideTheCaretAfterTheBoardWasMoved)
{
    makeBoxToCompose();
    type("a");
    press("Return");
    ASSERT_TRUE(comesToHold("あ", ""));
    dragBoard();

    type("kanji");
    ASSERT_TRUE(comesToHold("あ", "かんじ"));

    askForCandidates();
    EXPECT_TRUE(comeToStandByTheCaret());
}

TEST_P(CandidatesTest, goWithTheBoardWhenItIsMoved)
{
    makeBoxToCompose();
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));
    askForCandidates();

    dragBoard();
    if (GetParam() == InputMethodKind::Ibus)
        press("space"); // it shows the list at the new place with the next key

    EXPECT_TRUE(comeToStandByTheCaret());
    EXPECT_FALSE(host().writing().composed.isEmpty());
}

TEST_P(CandidatesTest, standAboveTheLayer)
{
    const OtherProgram sheet(desktop(), { 200, 100, 900, 600 }, Qt::white);
    constexpr QPoint onTheSheet(400, 250);
    desktop().startCompositor();
    host().steer(QStringLiteral("open annotation"));
    host().selectTool(QStringLiteral("text"));
    require([&] { return canvas().size() == desktop().screen().size(); }, "the layer");
    require([&] { return at(onTheSheet) == Qt::white; }, "the layer to show what is below it");
    makeBoxToCompose(onTheSheet);
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));

    askForCandidates();
    keepPicture("layer");

    EXPECT_TRUE(comeToStandByTheCaret());
    EXPECT_EQ(desktop().windows().inFrontAt(candidates().center()), candidates());
}

INSTANTIATE_TEST_SUITE_P(X11, CandidatesTest,
    testing::Values(InputMethodKind::Ibus, InputMethodKind::Fcitx), methodName);

} // namespace penwick::desktop
