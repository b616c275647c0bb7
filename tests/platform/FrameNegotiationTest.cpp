// SPDX-License-Identifier: MIT
// A frame that is shown, asked for, glided to, and pulled at by its user.
#include "platform/FrameDesk.h"

namespace penwick::platform {

namespace {

using Phase = FrameNegotiation::Phase;

const std::vector<FrameRow> rows {
    // Being shown
    { "shownWhereItWasAsked",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees(asked, borders);
        },
        "place 301,420 198x75; confirmed; settled", asked, Phase::Granted },
    { "shownWithoutAWindowManager",
        [](Desk &desk) {
            desk.show(asked, none);
            desk.sees(asked, none);
            desk.wait(1000);
        },
        "place 300,400 200x100; confirmed; settled", asked, Phase::Settled },
    { "bordersThatComeLateAreTakenOffTheContent",
        [](Desk &desk) {
            desk.show(asked, none);
            desk.sees(asked, none);
            desk.sees(asked.marginsAdded(borders), borders);
            desk.sees(asked, borders);
        },
        "place 300,400 200x100; confirmed; settled; place 301,420 198x75; confirmed; settled",
        asked, Phase::Granted },
    { "bordersThatNeverComeAreNotMissedUntilTheLastLook",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees(asked.marginsRemoved(borders), none);
            desk.wait(299);
        },
        "place 301,420 198x75; place 301,420 198x75", asked, Phase::Asked },
    { "bordersThatNeverCameAreGivenUp",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees(asked.marginsRemoved(borders), none);
            desk.wait(300);
            desk.sees(asked, none);
        },
        "place 301,420 198x75; place 301,420 198x75; place 300,400 200x100; confirmed; settled",
        asked, Phase::Granted },
    { "bordersThatWereToldWrongAreMended",
        [](Desk &desk) {
            desk.show(asked, borders);
            desk.sees({ 300, 400, 200, 137 }, { 1, 57, 1, 5 });
            desk.sees(asked, { 1, 57, 1, 5 });
        },
        "place 301,420 198x75; place 301,457 198x38; confirmed; settled", asked, Phase::Granted },
    { "bordersThatChangeLaterKeepTheOuterFrame",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.sees({ 300, 390, 200, 110 }, { 1, 30, 1, 5 });
            desk.sees(asked, { 1, 30, 1, 5 });
        },
        "place 301,430 198x65; confirmed; settled", asked, Phase::Granted },

    // Being asked
    { "askedFrameHoldsUntilItIsAnswered",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.look();
            desk.wait(299);
        },
        "place 351,450 198x75; place 351,450 198x75", elsewhere, Phase::Asked },
    { "moveThatIsGrantedIsToldOnce",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.sees(elsewhere, borders);
            desk.look();
            desk.wait(1000);
        },
        "place 351,450 198x75; confirmed; shifted 50,30; moved; settled", elsewhere,
        Phase::Settled },
    { "resizeThatIsGrantedIsToldBeforeTheMoveThatCameWithIt",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 290, 390, 210, 110 });
            desk.sees({ 290, 390, 210, 110 }, borders);
        },
        "place 291,410 208x85; confirmed; resized; moved; settled", { 290, 390, 210, 110 },
        Phase::Granted },
    { "refusalIsBelievedAfterSixLooks",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 300, 400, 300, 100 });
            desk.wait(300);
        },
        "place 301,420 298x75; place 301,420 298x75", asked, Phase::Settled },
    { "windowManagerThatGrantsAnotherSizeIsBelievedAfterSixLooks",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 300, 400, 300, 100 });
            desk.sees({ 300, 400, 250, 100 }, borders);
            desk.wait(300);
        },
        "place 301,420 298x75; place 301,420 298x75; resized; resizedByDesktop 300,400 300x100; "
        "settled",
        { 300, 400, 250, 100 }, Phase::Settled },
    { "answerToAnOlderRequestIsNotBelieved",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.ask(asked); // to and fro, before the first was answered
            desk.sees(asked, borders); // as it stood all the time
            desk.sees(elsewhere, borders); // the answer to the first
            desk.sees(asked, borders); // the answer to the second
            desk.wait(1000);
        },
        "place 351,450 198x75; place 301,420 198x75; confirmed; settled", asked, Phase::Settled },
    { "looksThatWereNotDueDoNotCount",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            for (int look = 0; look < 20; ++look)
                desk.look();
        },
        "place 351,450 198x75", elsewhere, Phase::Asked },
    { "askedWhileHiddenIsOnlyKept",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.askUnseen(elsewhere);
        },
        "", elsewhere, Phase::Settled },

    { "busyWindowManagerIsAskedAgainAfterThreeLooks",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask({ 300, 400, 300, 100 });
            desk.sees({ 300, 400, 300, 125 }, borders); // by the limits of an older request
            desk.wait(150);
            desk.sees({ 300, 400, 300, 100 }, borders);
        },
        "place 301,420 298x75; place 301,420 298x75; confirmed; resized; settled",
        { 300, 400, 300, 100 }, Phase::Granted },
    { "whatIsGrantedIsNotAskedForAgain",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.ask(elsewhere);
            desk.sees(elsewhere, borders);
            desk.sees(asked, borders); // the answer to an older request
            desk.wait(299);
        },
        "place 351,450 198x75; confirmed; shifted 50,30; moved; settled", elsewhere,
        Phase::Granted },

    // On the way
    { "setsOffAndCountsAsBeingThere",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
        },
        "shifted 50,30; moved", elsewhere, Phase::Gliding },
    { "wayToAnotherSizeIsToldAsAResize",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff({ 290, 390, 210, 110 });
        },
        "resized; moved", { 290, 390, 210, 110 }, Phase::Gliding },
    { "stepsOfAWayAreTakenAndNotTold",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.step({ 320, 410, 200, 100 });
            desk.sees({ 320, 410, 200, 100 }, borders);
            desk.wait(5000);
        },
        "shifted 50,30; moved; place 321,430 198x75", elsewhere, Phase::Gliding },
    { "arrivalIsARequestThatTellsNothingNew",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.ask(elsewhere);
            desk.sees(elsewhere, borders);
        },
        "shifted 50,30; moved; place 351,450 198x75; confirmed; settled", elsewhere,
        Phase::Granted },
    { "refusedArrivalTakesEverybodyBack",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.ask(elsewhere);
            desk.wait(300);
        },
        "shifted 50,30; moved; place 351,450 198x75; place 351,450 198x75; moveBegan; "
        "shifted -50,-30; moved; settled",
        asked, Phase::Settled },
    { "windowThatIsTakenHoldOfOnTheWayTakesEverybodyBackToIt",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.ask({ 320, 410, 200, 100 });
            desk.sees({ 320, 410, 200, 100 }, borders);
        },
        "shifted 50,30; moved; place 321,430 198x75; confirmed; shifted -30,-20; moved; settled",
        { 320, 410, 200, 100 }, Phase::Granted },
    { "frameThatIsHeardOfOnTheWayIsAskedForNothingBeforeTheEnd",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.hears(asked.topLeft());
            desk.wait(1000);
        },
        "shifted 50,30; moved", elsewhere, Phase::Gliding },
    { "bordersThatAreNotYetThereOnTheWayAreNotBelieved",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff(elsewhere);
            desk.sees(asked, none);
            desk.step(asked);
        },
        "shifted 50,30; moved; place 301,420 198x75", elsewhere, Phase::Gliding },
    { "bordersAndScaleThatChangeOnTheWayAreForTheNextStep",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.setOff({ 1300, 400, 200, 100 });
            desk.seen().scale = 2.0;
            desk.sees({ 900, 400, 100, 50 }, { 1, 10, 1, 3 });
            desk.step({ 1000, 400, 200, 100 });
            desk.ask({ 1300, 400, 200, 100 });
            desk.sees({ 1300, 400, 200, 100 }, { 1, 10, 1, 3 });
        },
        "shifted 1000,0; moved; rescaled; place 1001,410 198x87; place 1301,410 198x87; confirmed; "
        "settled",
        { 1300, 400, 200, 100 }, Phase::Granted },

    // The user
    { "moveByTheUserIsToldStepByStepAndBeginsOnce",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.sees({ 310, 400, 200, 100 }, borders);
            desk.wait(100);
            desk.sees({ 320, 405, 200, 100 }, borders);
        },
        "moveBegan; shifted 10,0; moved; settled; shifted 10,5; moved; settled",
        { 320, 405, 200, 100 }, Phase::Settled },
    { "moveAfterARestBeginsAnew",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.sees({ 310, 400, 200, 100 }, borders);
            desk.wait(500);
            desk.sees({ 320, 400, 200, 100 }, borders);
        },
        "moveBegan; shifted 10,0; moved; settled; moveBegan; shifted 10,0; moved; settled",
        { 320, 400, 200, 100 }, Phase::Settled },
    { "pullAtTheLeftEdgeIsAResizeByTheUserAndShiftsNothing",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.sees({ 290, 400, 210, 100 }, borders);
        },
        "resized; resizedByUser; moved; settled", { 290, 400, 210, 100 }, Phase::Settled },
    { "pullAtTheRightEdgeMovesNothing",
        [](Desk &desk) {
            desk.settle(asked, borders);
            desk.sees({ 300, 400, 210, 100 }, borders);
        },
        "resized; resizedByUser; settled", { 300, 400, 210, 100 }, Phase::Settled },
};

} // namespace

TEST_P(FrameNegotiationTest, isAnswered)
{
    expectAnswer(GetParam());
}

INSTANTIATE_TEST_SUITE_P(Requests, FrameNegotiationTest, testing::ValuesIn(rows),
    [](const auto &row) { return std::string(row.param.name); });

TEST(FrameNegotiation, nothingIsWaitedForOnceEverythingIsSettled)
{
    Desk desk;

    desk.settle(asked, borders);
    desk.sees({ 310, 400, 200, 100 }, borders);
    EXPECT_TRUE(desk.negotiation().nextLook().has_value()); // the user's rest
    desk.wait(500);

    EXPECT_FALSE(desk.negotiation().nextLook().has_value());
}

} // namespace penwick::platform
