// SPDX-License-Identifier: MIT
// When plain letters and digits rest: after each of a row of events.
#include "toolpanel/ToolKeyRest.h"

#include <gtest/gtest.h>

#include <string>

namespace penwick::test {

namespace {

/// What happens, a letter each: p a press on board or bar, b one on a placed box, k a key of the
/// box that is edited, e the keyboard's entry into the bar.
struct Row
{
    const char *events;
    bool rests;
};

class ToolKeyRestTable : public testing::TestWithParam<Row>
{ };

std::string eventsOf(const testing::TestParamInfo<Row> &row)
{
    return std::string("after_") + row.param.events;
}

void happen(ToolKeyRest &rest, char event)
{
    switch (event) {
    case 'p':
        return rest.pointerPressed();
    case 'b':
        return rest.placedBoxPressed();
    case 'k':
        return rest.keyEdited();
    default:
        return rest.keyboardEnteredBar();
    }
}

} // namespace

TEST_P(ToolKeyRestTable, says)
{
    ToolKeyRest rest;

    for (const char event : std::string(GetParam().events))
        happen(rest, event);

    EXPECT_EQ(rest.rests(), GetParam().rests);
}

INSTANTIATE_TEST_SUITE_P(Events, ToolKeyRestTable,
    testing::Values(Row { "", false }, Row { "p", false }, Row { "b", true }, Row { "k", true },
        Row { "e", false }, Row { "pk", true }, Row { "pkp", false }, Row { "pkpk", true },
        Row { "pke", false }, Row { "bp", false }, Row { "be", false }, Row { "pb", true },
        Row { "bpb", true }, Row { "kb", true }, Row { "ebk", true }, Row { "kkp", false },
        Row { "ppb", true }, Row { "eb", true }, Row { "ek", true }),
    eventsOf);

} // namespace penwick::test
