// SPDX-License-Identifier: MIT
// Writing Japanese on the board with a real input method: what is composed, and what becomes text.
#include "desktop/support/InputMethodFixture.h"
#include "desktop/support/OtherProgram.h"

namespace penwick::desktop {

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

TEST_P(InputMethodTest, keysThatChooseToolsChooseThemBesideTheBox)
{
    const QPoint corner = makeBoxToCompose();
    type("be");
    press("Return");
    press("Return");
    ASSERT_TRUE(comesToBePlaced(corner));
    const QMap<QString, QPoint> buttons = toolBar().buttons;
    const auto comesToBeSelected = [&](const char *tool) {
        const QPoint ofTheBackground(-14, -14);
        const QPoint pixel = buttons.value(QLatin1String(tool)) + ofTheBackground;
        return waitUntil([&] { return desktop().screen().pixel(pixel) == QColor(18, 168, 241); });
    };
    desktop().pointer().click(buttons.value(QStringLiteral("eraser")));
    desktop().pointer().moveTo(onScreen(farAway));
    ASSERT_TRUE(comesToBeSelected("eraser"));

    type("b");

    EXPECT_TRUE(comesToBeSelected("brush"));
}

TEST_P(InputMethodTest, undoAndRedoTakeBackAndBringWhatWasComposed)
{
    makeBoxToCompose();
    type("sakura");
    press("Return");
    ASSERT_TRUE(comesToHold("さくら", ""));

    desktop().keyboard().pressWith("Control_L", "z");
    EXPECT_TRUE(comesToHold("", ""));
    desktop().keyboard().pressWith("Control_L", "y");
    EXPECT_TRUE(comesToHold("さくら", ""));
}

// What ends an edit

TEST_P(InputMethodTest, compositionIsTextOnceSomethingElseIsPressed)
{
    const QPoint corner = makeBoxToCompose();
    type("sakura");
    ASSERT_TRUE(comesToHold("", "さくら"));

    click(elsewhere);
    ASSERT_TRUE(comesToBePlaced(corner));
    editAtTheBeginning(corner);

    EXPECT_TRUE(comesToHold("さくら", ""));
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
    askForCandidates();

    click(elsewhere);
    ASSERT_TRUE(comesToBePlaced(corner));
    EXPECT_TRUE(areCandidatesGone());
    doubleClick(corner + QPoint(100, 15));

    ASSERT_TRUE(comesToBeEdited(corner));
    const Writing writing = host().writing();
    EXPECT_TRUE(writing.text == QStringLiteral("漢字") || writing.text == QStringLiteral("感じ"))
        << writing.text.toStdString();
    EXPECT_EQ(writing.composed, QString());
}

TEST_P(InputMethodTest, compositionStaysWhileAToolIsChosenWithThePointer)
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

TEST_P(InputMethodTest, compositionIsTextOnceTheTextToolTakesTheKeys)
{
    const QPoint corner = makeBoxToCompose();
    type("saku");
    ASSERT_TRUE(comesToHold("", "さく"));
    const QPoint button = toolBar().buttons.value(QStringLiteral("text"));

    desktop().pointer().click(button);
    ASSERT_TRUE(comesToBePlaced(corner));
    host().waitForWindow(QStringLiteral("popover"));
    desktop().pointer().click(button); // closes the sizes
    doubleClick(corner + QPoint(100, 15));
    ASSERT_TRUE(comesToBeEdited(corner));

    EXPECT_TRUE(comesToHold("さく", ""));
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
    askForCandidates();

    desktop().windows().close(window());

    EXPECT_EQ(host().waitForExit(), 0);
    EXPECT_TRUE(areCandidatesGone());
}

INSTANTIATE_TEST_SUITE_P(X11, InputMethodTest,
    testing::Values(InputMethodKind::Ibus, InputMethodKind::Fcitx), methodName);

} // namespace penwick::desktop
