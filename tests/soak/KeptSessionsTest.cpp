// SPDX-License-Identifier: MIT
// Sessions that once differed from the second model, as short as they can be told. A line is what a
// random session says of itself when it differs; what one found is kept here by copying its lines.
#include "soak/Run.h"
#include "soak/Session.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace penwick::test {

namespace {

using Lines = std::vector<std::string>;

struct Kept
{
    const char *name;
    Lines lines;
};

class KeptSession : public testing::TestWithParam<Kept>
{ };

const Kept kept[] {
    { "popoverOpenedWhileTheBoardIsHidden",
        { "open kind 0", "hide", "tool brush", "show", "tool brush", "option brush#8",
            "turn and paint" } },
    { "boardMinimisedWhileAToolWaits",
        { "open kind 0", "press canvas 200,100", "move 300,150", "tool undo", "minimise", "restore",
            "turn and paint" } },
    { "placedBoxDeletedByAKey",
        { "open kind 0", "tool text", "press canvas 200,100", "release 200,100", "key b",
            "key Escape", "press b1 220,90", "release 220,90", "key BackSpace",
            "turn and paint" } },
    { "boxMadeUndoneAndClearedByOneRelease",
        { "open kind 0", "press canvas 200,100", "move 300,150", "release 300,150", "tool text",
            "press canvas 100,100", "tool undo", "tool clear", "release 100,100",
            "turn and paint" } },
    { "clearWaitingWhileTheDeleteButtonIsPressed",
        { "open kind 0", "tool text", "press canvas 200,100", "release 200,100", "key b",
            "turn and paint", "press x1 410,118", "tool clear", "release 410,118",
            "turn and paint" } },
    { "endWaitingWhileTheBoardIsMinimised",
        { "open kind 0", "press canvas 200,100", "move 300,150", "tool state", "minimise",
            "open kind 0", "turn and paint" } },
    { "deleteButtonPressedWhileABoxComesBack",
        { "open kind 0", "tool text", "press canvas 50,100", "release 50,100", "key b",
            "key Escape", "press canvas 50,200", "release 50,200", "key t", "key Escape",
            "press b1 60,90", "release 60,90", "key BackSpace", "press b2 60,190", "release 60,190",
            "press again b2 60,190", "release 60,190", "tool undo", "press x2 260,218",
            "release 260,218", "turn and paint" } },
};

} // namespace

TEST_P(KeptSession, goesAsTheSecondModelSays)
{
    const auto failure = Session().play(GetParam().lines);

    EXPECT_FALSE(failure) << *failure;
}

INSTANTIATE_TEST_SUITE_P(All, KeptSession, testing::ValuesIn(kept),
    [](const auto &session) { return std::string(session.param.name); });

TEST(SessionInWords, whatARandomSessionSaysOfItselfCanBeDoneAgain)
{
    for (std::uint64_t seed = freshSeed(), left = 20; left > 0; ++seed, --left) {
        const Lines lines = linesOf(seed, 100);

        Session again;
        const auto failure = again.play(lines);

        ASSERT_FALSE(failure) << "seed " << seed << '\n' << *failure;
        ASSERT_EQ(again.said(), lines) << "seed " << seed;
    }
}

TEST(SessionInWords, lineThatCannotBeDoneIsAFailure)
{
    const auto failure = Session().play({ "open kind 0", "release 200,100" });

    ASSERT_TRUE(failure);
    EXPECT_EQ(*failure,
        "cannot be done, or not any more: release 200,100\nthe last that was done: open kind 0\n");
}

} // namespace penwick::test
