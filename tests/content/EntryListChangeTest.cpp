// SPDX-License-Identifier: MIT
// The smallest change between two states of a list.
#include "content/EntryListChange.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <functional>
#include <vector>

namespace penwick::test {
namespace {

EntryList<int> listOf(const std::vector<int> &numbers)
{
    EntryList<int> list;
    for (const int number : numbers)
        list.append(number);
    return list;
}

EntryListChange between(const EntryList<int> &before, const EntryList<int> &after)
{
    return changeBetween(before, after, std::equal_to<>());
}

TEST(EntryListChange, sameListsDifferInNothing)
{
    EXPECT_TRUE(between({}, {}).isNothing());
    EXPECT_TRUE(between(listOf({ 1, 2 }), listOf({ 1, 2 })).isNothing());
}

TEST(EntryListChange, namesWhatCameAndWentAndWhere)
{
    EXPECT_EQ(between(listOf({ 1, 2 }), listOf({ 1, 2, 3 })), (EntryListChange { 2, 0, 1 }));
    EXPECT_EQ(between(listOf({ 1, 2, 3 }), listOf({ 1, 3 })), (EntryListChange { 1, 1, 0 }));
    EXPECT_EQ(between(listOf({ 1, 2, 3 }), {}), (EntryListChange { 0, 3, 0 }));
    EXPECT_EQ(between(listOf({ 1, 2, 3 }), listOf({ 1, 7, 8, 3 })), (EntryListChange { 1, 1, 2 }));
    EXPECT_EQ(between(listOf({ 1, 1 }), listOf({ 1, 1, 1 })), (EntryListChange { 2, 0, 1 }));
}

TEST(EntryListChange, whatTwoListsShareIsNotComparedAgain)
{
    EntryList<int> before = listOf({ 1, 2, 3, 4, 5 });
    EntryList<int> after = before;
    after.append(6);
    int comparisons = 0;
    const auto counted = [&comparisons](int a, int b) {
        ++comparisons;
        return a == b;
    };

    EXPECT_EQ(changeBetween(before, after, counted), (EntryListChange { 5, 0, 1 }));
    EXPECT_LE(comparisons, 2);
}

RC_GTEST_PROP(EntryListChangeProperties, changeMakesTheOneListIntoTheOther,
    (const std::vector<bool> &first, const std::vector<bool> &second))
{
    const std::vector<int> before(first.begin(), first.end());
    const std::vector<int> after(second.begin(), second.end());
    const EntryListChange change = between(listOf(before), listOf(after));

    std::vector<int> made(before.begin(), before.begin() + change.first);
    const auto come = after.begin() + change.first;
    made.insert(made.end(), come, come + change.added);
    made.insert(made.end(), before.begin() + change.first + change.removed, before.end());
    RC_ASSERT(made == after);
}

} // namespace
} // namespace penwick::test
