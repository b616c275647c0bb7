// SPDX-License-Identifier: MIT
// Writing Japanese on the board with a real input method: what is composed, what becomes text, and
// where the list of what may be meant stands.
#include "desktop/support/InputMethod.h"
#include "desktop/support/OtherProgram.h"
#include "desktop/support/TextBoxFixture.h"

namespace penwick::desktop {

namespace {

constexpr QPoint place { 300, 150 };
constexpr QPoint elsewhere { 600, 300 };

/// Base of the tests: a board with the text tool, and an input method beside it.
class InputMethodTest : public TextBoxTest, public testing::WithParamInterface<InputMethodKind>
{
protected:
    InputMethodTest()
        : m_method(desktop(), GetParam())
    {
        open(HostProgram::Steered, {}, m_method.environment());
        host().selectTool(QStringLiteral("text"));
        desktop().pointer().moveTo(onScreen(farAway));
    }

    /// A box in which the next letter is composed.
    QPoint makeBoxToCompose(QPoint clicked = place)
    {
        const QPoint corner = makeBox(clicked);
        // The input method hears of the box some time after it is there.
        require(
            [&] {
                desktop().keyboard().press("a");
                require([&] { return !isBlank(host().writing()); }, "a letter to arrive");
                const bool isComposed = !host().writing().composed.isEmpty();
                desktop().keyboard().press("BackSpace");
                require([&] { return isBlank(host().writing()); }, "the letter to go");
                return isComposed;
            },
            "the input method to compose");
        return corner;
    }

    static bool isBlank(const Writing &writing)
    {
        return writing.text.isEmpty() && writing.composed.isEmpty();
    }

    void type(const char *letters) { desktop().keyboard().type(letters); }
    void press(const char *key) { desktop().keyboard().press(key); }

    /// Whether the box with the keyboard comes to have this text, and this composed in it.
    testing::AssertionResult comesToHold(const char *text, const char *composed)
    {
        Writing seen;
        const bool came = waitUntil([&] {
            seen = host().writing();
            return seen.text == QString::fromUtf8(text)
                && seen.composed == QString::fromUtf8(composed);
        });
        return came ? testing::AssertionSuccess()
                    : testing::AssertionFailure() << "it holds \"" << seen.text.toStdString()
                                                  << "\" and \"" << seen.composed.toStdString();
    }

    /// The list of what may be meant, for which it asks.
    QRect askForCandidates()
    {
        press("space");
        press("space");
        QRect list;
        require(
            [&] {
                const std::vector<QRect> areas = desktop().windows().unmanaged();
                list = areas.size() == 1 ? areas.front() : QRect();
                return list.height() > 100;
            },
            "a list of what may be meant");
        return list;
    }

    /// Whether the list comes to stand right above or below the caret that it is for.
    testing::AssertionResult standsBesideCaret(const QRect &list)
    {
        constexpr int near = 12;
        const QRect caret = host().writing().caret;
        const bool isBelow = std::abs(list.top() - caret.bottom()) <= near;
        const bool isAbove = std::abs(list.bottom() - caret.top()) <= near;
        if ((isBelow || isAbove) && std::abs(list.left() - caret.left()) <= near)
            return testing::AssertionSuccess();
        return testing::AssertionFailure()
            << "the list stands at " << list.x() << ", " << list.y() << " to " << list.bottom()
            << ", the caret at " << caret.x() << ", " << caret.y() << " to " << caret.bottom();
    }

    QRect boxOnScreen(QPoint corner) { return { onScreen(corner), newBoxSize }; }

private:
    InputMethod m_method;
};

} // namespace

TEST_P(InputMethodTest, composesWhatIsTypedAndCommitsItOnce)
{
    makeBoxToCompose();

    type("sakura");
    EXPECT_TRUE(comesToHold("", "さくら"));
    press("Return");
    EXPECT_TRUE(comesToHold("さくら", ""));

    type("kakikukeko");
    press("Return");
    EXPECT_TRUE(comesToHold("さくらかきくけこ", ""));
    press("BackSpace");
    EXPECT_TRUE(comesToHold("さくらかきくけ", ""));
}

TEST_P(InputMethodTest, keysThatComeFastArriveOnceAndInOrder)
{
    makeBoxToCompose();

    for (int round = 0; round < 5; ++round) {
        type("sakura");
        press("Return");
        type("momo");
        press("Return");
    }

    EXPECT_TRUE(comesToHold("さくらももさくらももさくらももさくらももさくらもも", ""));
}

TEST_P(InputMethodTest, keyOfTheCompositionIsNoneOfTheBox)
{
    const QPoint corner = makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    press("BackSpace");
    EXPECT_TRUE(comesToHold("", "さく"));
    press("Escape");
    EXPECT_TRUE(comesToHold("", ""));
    EXPECT_TRUE(isEdited(corner));

    press("Escape");
    EXPECT_TRUE(vanishes(corner));
}

TEST_P(InputMethodTest, keysThatChooseToolsChooseNoneWhileComposing)
{
    const QPoint corner = makeBoxToCompose();
    type("be");
    EXPECT_TRUE(comesToHold("", "べ"));
    press("Return");
    EXPECT_TRUE(comesToHold("べ", ""));
    press("Return");
    ASSERT_TRUE(comesToBePlaced(corner));

    click(elsewhere); // the text tool's, if it is still chosen
    EXPECT_TRUE(comesToBeEdited(boxOf(elsewhere)));
}

// Where the list stands

TEST_P(InputMethodTest, candidatesStandBesideTheCaretOfANewBox)
{
    const QPoint corner = makeBoxToCompose();
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));

    const QRect list = askForCandidates();

    EXPECT_EQ(host().writing().caret.topLeft(), onScreen(corner) + QPoint(5, 6));
    EXPECT_TRUE(standsBesideCaret(list));
}

TEST_P(InputMethodTest, candidatesStandBesideTheCaretOfABoxThatWasDragged)
{
    const QPoint corner = makeBoxToCompose();
    type("a");
    press("Return");
    ASSERT_TRUE(comesToHold("あ", ""));
    click(farAway);
    ASSERT_TRUE(comesToBePlaced(corner));
    const QPoint grip(60, 15);
    const QPoint way(120, -60);
    drag({ corner + grip, corner + grip + way / 2, corner + grip + way });
    ASSERT_TRUE(comesToBePlaced(corner + way));

    doubleClick(corner + way + grip);
    ASSERT_TRUE(comesToBeEdited(corner + way));
    press("End");
    type("kanji");
    ASSERT_TRUE(comesToHold("あ", "かんじ"));
    const QRect list = askForCandidates();

    EXPECT_TRUE(boxOnScreen(corner + way).adjusted(0, 0, 0, 10).contains(host().writing().caret));
    EXPECT_TRUE(standsBesideCaret(list));
}

TEST_P(InputMethodTest, candidatesStandBesideTheCaretOfABoxThatMovedAwayFromAnEdge)
{
    makeBoxToCompose({ 750, 150 });
    for (int word = 0; word < 2; ++word) {
        type("sakuramomo");
        press("Return");
    }
    type("kanji");
    ASSERT_TRUE(comesToHold("さくらももさくらもも", "かんじ"));

    const QRect list = askForCandidates();

    EXPECT_TRUE(canvas().contains(host().writing().caret));
    EXPECT_TRUE(standsBesideCaret(list));
}

TEST_P(InputMethodTest, candidatesStandBesideTheCaretOfATextThatIsScrolled)
{
    makeBoxToCompose();
    for (int line = 0; line < 24; ++line)
        desktop().keyboard().pressWith("Shift_L", "Return");
    type("kanji");
    ASSERT_TRUE(comesToHold("\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n\n", "かんじ"));

    const QRect list = askForCandidates();

    EXPECT_TRUE(canvas().contains(host().writing().caret));
    EXPECT_TRUE(standsBesideCaret(list));
}

TEST_P(InputMethodTest, candidatesStandBesideTheCaretAfterTheBoardWasMoved)
{
    makeBoxToCompose();
    type("a");
    press("Return");
    ASSERT_TRUE(comesToHold("あ", ""));
    const QPoint before = canvas().topLeft();
    const QPoint title = before + QPoint(400, -10);
    desktop().pointer().drag({ title, title + QPoint(40, 25), title + QPoint(80, 50) });
    require([&] { return canvas().topLeft() == before + QPoint(80, 50); }, "the board to move");

    type("kanji");
    ASSERT_TRUE(comesToHold("あ", "かんじ"));

    EXPECT_TRUE(standsBesideCaret(askForCandidates()));
}

// What ends an edit keeps what is composed

TEST_P(InputMethodTest, compositionIsTextOnceSomethingElseIsPressed)
{
    const QPoint corner = makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    click(elsewhere);
    ASSERT_TRUE(comesToBePlaced(corner));
    doubleClick(corner + QPoint(100, 15));
    ASSERT_TRUE(comesToBeEdited(corner));

    EXPECT_TRUE(comesToHold("さくら", ""));
    press("End");
    type("momo");
    EXPECT_TRUE(comesToHold("さくら", "もも")) << "nothing of the former one is left";
}

TEST_P(InputMethodTest, compositionIsTextOnceItsOwnBoxIsPressed)
{
    makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    click(place + QPoint(150, 10));
    EXPECT_TRUE(comesToHold("さくら", ""));

    type("momo");
    EXPECT_TRUE(comesToHold("さくら", "もも"));
    press("Return");
    EXPECT_TRUE(comesToHold("さくらもも", ""));
}

TEST_P(InputMethodTest, conversionIsTextAsItIsShownOnceTheBoxIsLeft)
{
    const QPoint corner = makeBoxToCompose();
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));
    static_cast<void>(askForCandidates());
    const QString shown = host().writing().composed;

    click(elsewhere);
    ASSERT_TRUE(comesToBePlaced(corner));
    EXPECT_TRUE(waitUntil([&] { return desktop().windows().unmanaged().empty(); }));
    doubleClick(corner + QPoint(100, 15));

    EXPECT_TRUE(comesToHold(qUtf8Printable(shown), ""));
}

TEST_P(InputMethodTest, compositionStaysWhileATooIsChosenWithThePointer)
{
    makeBoxToCompose();
    type("saku");
    ASSERT_TRUE(comesToHold("", "さく"));

    const WindowState bar = toolBar();
    desktop().pointer().click(bar.buttons.value(QStringLiteral("eraser")));
    desktop().pointer().moveTo(onScreen(farAway));
    type("ra");

    EXPECT_TRUE(comesToHold("", "さくら"));
    press("Return");
    EXPECT_TRUE(comesToHold("さくら", ""));
}

TEST_P(InputMethodTest, compositionIsNotLostWhenAnotherProgramIsActivated)
{
    makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    const OtherProgram other(desktop(), { 20, 20, 150, 100 }, Qt::darkGreen);
    const QPoint inIt = other.area().center();
    desktop().pointer().click(inIt);
    require([&] { return desktop().windows().active() == other.window(); }, "the other program");
    desktop().windows().activate(window());
    require([&] { return desktop().windows().active() == window(); }, "the board");

    EXPECT_TRUE(waitUntil([&] {
        const Writing writing = host().writing();
        return writing.text + writing.composed == QStringLiteral("さくら");
    })) << host().writing().text.toStdString()
        << '|' << host().writing().composed.toStdString();
    type("momo");
    press("Return");
    EXPECT_TRUE(waitUntil([&] { return host().writing().composed.isEmpty(); }));
    EXPECT_EQ(host().writing().text, QStringLiteral("さくらもも"));
}

TEST_P(InputMethodTest, boxThatIsDeletedTakesItsCompositionAlong)
{
    const QPoint corner = makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    click(deleteButtonOf(corner));
    EXPECT_TRUE(vanishes(corner));
    EXPECT_EQ(darkest(pictureOf(QRect(corner, newBoxSize))), 255);

    makeBoxToCompose(elsewhere);
    type("momo");
    EXPECT_TRUE(comesToHold("", "もも"));
}

TEST_P(InputMethodTest, sessionEndsInTheMiddleOfAComposition)
{
    makeBoxToCompose();
    type("kanji");
    ASSERT_TRUE(comesToHold("", "かんじ"));
    static_cast<void>(askForCandidates());

    desktop().windows().close(window());

    EXPECT_EQ(host().waitForExit(), 0);
    EXPECT_TRUE(waitUntil([&] { return desktop().windows().unmanaged().empty(); }));
}

INSTANTIATE_TEST_SUITE_P(X11, InputMethodTest,
    testing::Values(InputMethodKind::Ibus, InputMethodKind::Fcitx),
    [](const auto &kind) { return kind.param == InputMethodKind::Ibus ? "ibus" : "fcitx5"; });

} // namespace penwick::desktop
