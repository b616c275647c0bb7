// SPDX-License-Identifier: MIT
// What window managers do with a frame, in any order and at any time; states of windows; screens.
#include "platform/FrameDesk.h"

namespace penwick::platform {

namespace {

using Phase = FrameNegotiation::Phase;

class FrameOnDesktopsTest : public FrameNegotiationTest
{ };

const std::vector<FrameRow> rows {
    // The window manager's own
    { "frameThatTellsItsCornerIsBelievedBeforeTheToolkit",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.wait(5000);
            desk.hears(QPoint(340, 400)); // dragged by its title bar: the toolkit hears at the end
        },
        "confirmed; settled; moveBegan; shifted 40,0; moved; settled", { 340, 400, 200, 100 },
        Phase::Settled },
    { "frameMovedWithoutAWordToItsWindowRemindsTheToolkitOnce",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.seen().frame = QRect(0, 0, 200, 100);
            desk.seen().margins = borders;
            desk.hears(QPoint(0, 0));
            desk.hears(asked.topLeft());
            desk.look();
        },
        "place 301,420 198x75; place 302,420 198x75; place 301,420 198x75; confirmed; confirmed; "
        "settled",
        asked, Phase::Granted },
    { "frameMovedTwiceByTheWindowManagerIsAMoveInTheEnd",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.wait(5000);
            desk.hears(QPoint(310, 400));
            desk.hears(QPoint(300, 400));
        },
        "confirmed; settled; moveBegan; shifted 10,0; moved; settled; shifted -10,0; moved; "
        "settled",
        asked, Phase::Settled },
    { "frameOfASlowWindowManagerIsPutWhereItWasAsked",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees({ 0, 0, 200, 100 }, borders); // inside a frame in the making
            desk.wait(300); // given up
            desk.hears(QPoint(300, 400));
            desk.sees(asked, borders);
        },
        "place 301,420 198x75; place 301,420 198x75; moveBegan; shifted -300,-400; moved; settled; "
        "confirmed; shifted 300,400; moved; settled",
        asked, Phase::Granted },
    { "cornerThatWasToldWithInvisibleBordersAndIsMendedMovesNothing",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees(asked, borders);
            desk.hears(asked.topLeft() - QPoint(10, 10)); // mutter, before it tells its borders
            desk.wait(100);
            desk.hears(asked.topLeft());
            desk.wait(5000);
        },
        "place 301,420 198x75; confirmed; settled; confirmed; settled", asked, Phase::Settled },
    { "frameThatIsBuiltAroundTheContentTakesItsTitleBarFromIt",
        [](Desk &desk) {
            desk.show(asked, none); // KWin does not say what its borders will be
            desk.sees(asked, none);
            desk.hears(asked.topLeft() - QPoint(0, 37));
            desk.sees({ 300, 363, 200, 137 }, { 0, 37, 0, 0 });
            desk.wait(20);
            desk.hears(asked.topLeft());
            desk.sees(asked, { 0, 37, 0, 0 });
            desk.wait(5000);
        },
        "place 300,400 200x100; confirmed; settled; place 300,437 200x63; confirmed; settled",
        asked, Phase::Settled },
    { "tiledWindowIsAskedForOnceMoreAndThenLeftToItsDesktop",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees({ 0, 0, 640, 800 }, borders);
            desk.hears(QPoint(0, 0));
            desk.wait(5000);
            desk.sees({ 0, 0, 640, 745 }, borders); // another program has opened
            desk.wait(5000);
        },
        "place 301,420 198x75; place 301,420 198x75; resized; resizedByDesktop 300,400 200x100; "
        "moved; "
        "settled; resized; resizedByUser; settled",
        { 0, 0, 640, 745 }, Phase::Settled },
    { "windowManagerThatEndsMovesNothing",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.wait(5000);
            desk.seen().content = QRect(301, 420, 198, 75);
            desk.seen().frame = desk.seen().content; // nothing is around it
            desk.seen().margins = none;
            desk.hears(std::nullopt);
            desk.wait(1000);
        },
        "confirmed; settled; confirmed; settled", asked, Phase::Settled },
    { "windowManagerThatComesBackBuildsTheFrameElsewhereFirst",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.hears(std::nullopt);
            desk.wait(1000);
            desk.hears(QPoint(0, 0));
            desk.hears(asked.topLeft());
            desk.wait(1000);
        },
        "confirmed; settled; confirmed; settled; confirmed; settled", asked, Phase::Settled },
    { "windowManagerThatComesBackAndPutsItElsewhereMovesItInTheEnd",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.hears(std::nullopt);
            desk.wait(1000);
            desk.hears(QPoint(0, 0));
            desk.wait(1000);
        },
        "confirmed; settled; confirmed; settled; place 301,420 198x75; moveBegan; shifted "
        "-300,-400; moved; settled; place 2,20 198x75; place 1,20 198x75; confirmed; settled",
        { 0, 0, 200, 100 }, Phase::Granted },

    // States of the window
    { "minimisedWindowTellsNothingAndWaitsForNothing",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.seen().isMinimised = true;
            desk.sees({ -500, -500, 200, 100 }, borders);
            desk.wait(5000);
        },
        "place 351,450 198x75", elsewhere, Phase::Suspended },
    { "restoredWindowIsWaitedForAnew",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.seen().isMinimised = true;
            desk.look();
            desk.seen().isMinimised = false;
            desk.wait(5000);
            desk.look();
            desk.wait(299);
            desk.sees(elsewhere, borders);
        },
        "place 351,450 198x75; place 351,450 198x75; confirmed; shifted 50,30; moved; settled",
        elsewhere, Phase::Granted },
    { "minimisedAfterItWasGrantedIsSettled",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.sees(elsewhere, borders);
            desk.seen().isMinimised = true;
            desk.look();
        },
        "place 351,450 198x75; confirmed; shifted 50,30; moved; settled", elsewhere,
        Phase::Settled },
    { "maximisedWindowIsNotAskedBackIntoItsBorders",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.seen().isArranged = true;
            desk.sees({ 0, 0, 1280, 800 }, { 0, 20, 0, 0 });
        },
        "resized; resizedByUser; moved; settled", { 0, 0, 1280, 800 }, Phase::Settled },
    { "rolledUpWindowKeepsItsFrame",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.hears(asked.topLeft());
            desk.wait(5000);
            desk.hears(asked.topLeft()); // its frame is lower, its corner and its content the same
        },
        "confirmed; settled", asked, Phase::Settled },

    // Screens
    { "anotherScaleIsToldFirstAndTheMoveBeforeTheSize",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.seen().scale = 2.0;
            desk.sees({ 1300, 400, 100, 50 }, { 1, 10, 1, 3 });
        },
        "rescaled; moveBegan; shifted 1000,0; moved; resized; settled", { 1300, 400, 100, 50 },
        Phase::Settled },
    { "anotherScaleInTheMiddleOfAnAnswerKeepsWhatWasAsked",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 1300, 400, 200, 100 });
            desk.seen().scale = 2.0;
            desk.sees({ 1300, 400, 100, 50 }, { 1, 10, 1, 3 });
            desk.sees({ 1300, 400, 200, 100 }, { 1, 10, 1, 3 });
        },
        "place 1301,420 198x75; place 1301,410 198x87; rescaled; confirmed; shifted 1000,0; moved; "
        "settled",
        { 1300, 400, 200, 100 }, Phase::Granted },
    { "scaleThatIsKnownAfterATooEarlyGrantAsksAgain",
        [](Desk &desk) {
            desk.show(asked, none, 2.0);
            desk.sees(asked, none); // so the toolkit believes before the desktop has answered
            desk.seen().scale = 1.0;
            desk.sees({ 0, 0, 202, 125 }, borders);
            desk.seen().scale = 2.0;
            desk.sees({ 300, 390, 202, 113 }, { 1, 10, 1, 3 });
            desk.sees(asked, { 1, 10, 1, 3 });
        },
        "place 300,400 200x100; confirmed; settled; place 301,420 198x75; rescaled; "
        "place 301,410 198x87; rescaled; confirmed; settled",
        asked, Phase::Granted },
    { "requestThatWasNotGrantedWithoutAWordIsLearned",
        [](Desk &desk) {
            desk.settle(asked, none);
            desk.ask({ 20, 30, 200, 100 });
            desk.sees({ 20, 30, 200, 100 }, none); // so the toolkit believes
            desk.wait(1000);
            desk.learns({ 300, 400, 220, 100 });
        },
        "place 20,30 200x100; confirmed; shifted -280,-370; moved; settled; resized; moved; "
        "settled",
        { 300, 400, 220, 100 }, Phase::Settled },
    { "requestThatWasGrantedWithoutAWordIsNoNews",
        [](Desk &desk) {
            desk.settle(asked, none);
            desk.learns(asked);
        },
        "", asked, Phase::Settled },
    { "requestThatIsStillOpenIsNotLearnedOf",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 20, 30, 200, 100 });
            desk.learns(asked);
        },
        "place 21,50 198x75", { 20, 30, 200, 100 }, Phase::Asked },
    { "halfAPointOfABorderMovesNothing",
        [](Desk &desk) {
            desk.settle(asked, borders, 2.0);
            desk.sees({ 299, 401, 201, 100 }, borders);
        },
        "", asked, Phase::Settled },
    { "cornerIsScaledInsideItsScreen",
        [](Desk &desk) {
            desk.seen().screen = QPoint(1280, 0);
            desk.settle({ 1400, 100, 200, 100 }, borders, 2.0);
            desk.hears(QPoint(1280 + 2 * 120, 2 * 100));
            desk.wait(5000);
            desk.hears(QPoint(1280 + 2 * 140, 2 * 100));
        },
        "confirmed; settled; moveBegan; shifted 20,0; moved; settled", { 1420, 100, 200, 100 },
        Phase::Settled },
    { "anotherPrimaryScreenMovesTheWindowInItsCoordinatesAlone",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.seen().origin = QPoint(1280, 1024);
            desk.look();
            desk.look();
        },
        "moved; settled", asked, Phase::Settled },
    { "anotherPrimaryScreenInTheMiddleOfAnAnswerIsToldWithIt",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 300, 400, 250, 100 });
            desk.seen().origin = QPoint(1280, 1024);
            desk.look();
            desk.sees({ 300, 400, 250, 100 }, borders);
        },
        "place 301,420 248x75; confirmed; resized; moved; settled", { 300, 400, 250, 100 },
        Phase::Granted },
};

} // namespace

TEST_P(FrameOnDesktopsTest, isAnswered)
{
    expectAnswer(GetParam());
}

INSTANTIATE_TEST_SUITE_P(Desktops, FrameOnDesktopsTest, testing::ValuesIn(rows),
    [](const auto &row) { return std::string(row.param.name); });

} // namespace penwick::platform
