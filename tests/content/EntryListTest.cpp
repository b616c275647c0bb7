// SPDX-License-Identifier: MIT
// An array that is a value: against plain vectors, and what its copies share.
#include "content/EntryList.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

namespace penwick::test {
namespace {

using Numbers = std::vector<int>;

EntryList<int> listOf(const Numbers &numbers)
{
    EntryList<int> list;
    for (const int number : numbers)
        list.append(number);
    return list;
}

Numbers contents(const EntryList<int> &list)
{
    return { list.begin(), list.end() };
}

TEST(EntryList, newListIsEmpty)
{
    const EntryList<int> list;

    EXPECT_TRUE(list.isEmpty());
    EXPECT_EQ(list.size(), 0);
    EXPECT_EQ(list.begin(), list.end());
}

TEST(EntryList, iteratorStandsAtTheFirstEntryAndStepsOnAfterItIsRead)
{
    const EntryList<int> list = listOf({ 4, 5 });
    auto place = list.begin();

    EXPECT_EQ(*place++, 4);
    EXPECT_EQ(*place, 5);
}

TEST(EntryList, sharesWithALongerCopyNoMoreThanItsSettledEntries)
{
    const EntryList<int> list = listOf({ 1, 2 });
    EntryList<int> longer = list;
    longer.append(3);
    longer.append(4);

    EXPECT_EQ(list.sharedStart(longer), 1);
    EXPECT_EQ(longer.sharedStart(list), 1);
}

TEST(EntryList, removedEntryThatNoCopyShowsIsNotKeptAlive)
{
    EntryList<std::shared_ptr<int>> list;
    for (const int number : { 1, 2, 3 })
        list.append(std::make_shared<int>(number));
    const std::weak_ptr<int> second = list[1];

    list.removeLast();
    list.removeLast();

    EXPECT_TRUE(second.expired());
    EXPECT_EQ(*list.last(), 1);
}

TEST(EntryList, keepsTheOrderOfAppending)
{
    const EntryList<int> list = listOf({ 1, 2, 3 });

    EXPECT_FALSE(list.isEmpty());
    EXPECT_EQ(list.size(), 3);
    EXPECT_EQ(list.first(), 1);
    EXPECT_EQ(list[1], 2);
    EXPECT_EQ(list.last(), 3);
    EXPECT_EQ(contents(list), (Numbers { 1, 2, 3 }));
}

TEST(EntryList, copyKeepsWhatItWasWhileTheOriginalGoesOn)
{
    EntryList<int> list = listOf({ 1, 2, 3 });
    const EntryList<int> copy = list;

    list.mutableLast() = 30;
    list.append(4);
    list.removeAt(0);

    EXPECT_EQ(contents(copy), (Numbers { 1, 2, 3 }));
    EXPECT_EQ(contents(list), (Numbers { 2, 30, 4 }));
}

TEST(EntryList, originalKeepsWhatItWasWhileTheCopyGoesOn)
{
    const EntryList<int> list = listOf({ 1, 2, 3 });
    EntryList<int> copy = list;

    copy.removeLast();
    copy.mutableLast() = 20;
    copy.append(5);

    EXPECT_EQ(contents(list), (Numbers { 1, 2, 3 }));
    EXPECT_EQ(contents(copy), (Numbers { 1, 20, 5 }));
}

TEST(EntryList, copiesThatGrowApartDoNotSeeEachOthersEntries)
{
    EntryList<int> list = listOf({ 1, 2 });
    EntryList<int> copy = list;

    list.append(3);
    list.append(4);
    copy.append(30);
    copy.append(40);

    EXPECT_EQ(contents(list), (Numbers { 1, 2, 3, 4 }));
    EXPECT_EQ(contents(copy), (Numbers { 1, 2, 30, 40 }));
}

TEST(EntryList, movedFromListIsEmptyAndCanBeFilledAgain)
{
    EntryList<int> list = listOf({ 1, 2 });
    EntryList<int> target = listOf({ 7, 8, 9 });

    target = std::move(list);

    EXPECT_EQ(contents(target), (Numbers { 1, 2 }));
    // NOLINTBEGIN(bugprone-use-after-move, clang-analyzer-cplusplus.Move): what is tested
    EXPECT_TRUE(list.isEmpty());
    list.append(3);
    EXPECT_EQ(contents(list), (Numbers { 3 }));
    // NOLINTEND(bugprone-use-after-move, clang-analyzer-cplusplus.Move)
}

TEST(EntryList, walkOverACopyGoesOnWhileTheOriginalGrows)
{
    EntryList<int> list = listOf({ 1, 2, 3 });
    const EntryList<int> copy = list;
    Numbers walked;

    for (const int &number : copy) {
        for (int more = 0; more < 1000; ++more)
            list.append(more);
        walked.push_back(number);
    }

    EXPECT_EQ(walked, (Numbers { 1, 2, 3 }));
    EXPECT_EQ(list.size(), 3003);
}

TEST(EntryList, firstIndexWhereFindsTheFirstMatchFromTheFront)
{
    const EntryList<int> list = listOf({ 5, 7, 9, 7 });

    EXPECT_EQ(list.firstIndexWhere([](int number) { return number == 7; }), 1);
    EXPECT_EQ(list.firstIndexWhere([](int number) { return number == 8; }), std::nullopt);
}

TEST(EntryList, clearedListCanBeFilledAgain)
{
    EntryList<int> list = listOf({ 1, 2, 3 });
    const EntryList<int> copy = list;

    list.clear();
    EXPECT_TRUE(list.isEmpty());
    list.append(9);

    EXPECT_EQ(contents(list), (Numbers { 9 }));
    EXPECT_EQ(contents(copy), (Numbers { 1, 2, 3 }));
}

/// Counts how often an entry was copied.
struct Counted
{
    explicit Counted(int &counter)
        : copies(&counter)
    { }
    Counted(const Counted &other)
        : copies(other.copies)
    {
        ++*copies;
    }
    // NOLINTNEXTLINE(bugprone-unhandled-self-assignment): the counter is not its own
    Counted &operator=(const Counted &other)
    {
        copies = other.copies;
        ++*copies;
        return *this;
    }
    Counted(Counted &&) = default;
    Counted &operator=(Counted &&) = default;
    ~Counted() = default;

    int *copies;
};

TEST(EntryList, copyingAndAppendingCopyOneEntryWhateverTheLength)
{
    int copies = 0;
    EntryList<Counted> list;
    for (int length = 0; length < 10'000; ++length)
        list.append(Counted(copies));
    ASSERT_EQ(copies, 0);

    std::vector<EntryList<Counted>> older;
    for (int event = 0; event < 100; ++event) {
        older.push_back(list); // the last entry of the copy
        list.mutableLast() = Counted(copies);
        list.append(Counted(copies));
    }

    EXPECT_LE(copies, 1000); // and the vector's own growing
}

TEST(EntryList, removingTheLastCopiesOneEntryThoughCopiesAreAlive)
{
    int copies = 0;
    EntryList<Counted> list;
    for (int length = 0; length < 10'000; ++length)
        list.append(Counted(copies));
    const EntryList<Counted> older = list;
    copies = 0;

    for (int count = 0; count < 100; ++count)
        list.removeLast();

    EXPECT_EQ(copies, 100);
    EXPECT_EQ(older.size(), 10'000);
}

TEST(EntryList, listThatIsAloneKeepsNoRemovedEntryAlive)
{
    EntryList<std::shared_ptr<int>> list;
    std::vector<std::weak_ptr<int>> entries;
    for (int number = 0; number < 5; ++number) {
        const auto entry = std::make_shared<int>(number);
        entries.push_back(entry);
        list.append(entry);
    }

    list.removeLast();
    list.removeLast();
    list.removeAt(1);
    EXPECT_TRUE(entries[4].expired());
    EXPECT_TRUE(entries[3].expired());
    EXPECT_FALSE(entries[2].expired());
    EXPECT_TRUE(entries[1].expired());

    list.clear();
    EXPECT_TRUE(entries[2].expired());
    EXPECT_TRUE(entries[0].expired());
}

TEST(EntryListDeathTest, indexOutsideStopsTheProcess)
{
    EntryList<int> list = listOf({ 1 });
    const char *const message = "^penwick: fatal error: an index lies outside the list\n$";

    EXPECT_DEATH(static_cast<void>(list[1]), message);
    EXPECT_DEATH(static_cast<void>(list[-1]), message);
    EXPECT_DEATH(list.removeAt(1), message);
    list.clear();
    EXPECT_DEATH(static_cast<void>(list.first()), message);
    EXPECT_DEATH(static_cast<void>(list.last()), message);
    EXPECT_DEATH(static_cast<void>(list.mutableLast()), message);
    EXPECT_DEATH(list.removeLast(), message);
}

/// A list and the plain vector that it must equal.
struct Pair
{
    EntryList<int> list;
    Numbers numbers;

    void changeAtRandom()
    {
        const int number = *rc::gen::arbitrary<int>();
        const int change = numbers.empty() ? 0 : *rc::gen::inRange(0, 12);
        if (change < 5) {
            list.append(number);
            numbers.push_back(number);
        } else if (change < 8) {
            list.removeLast();
            numbers.pop_back();
        } else if (change < 9) {
            const int index = *rc::gen::inRange(0, static_cast<int>(numbers.size()));
            list.removeAt(index);
            numbers.erase(numbers.begin() + index);
        } else if (change < 11) {
            list.mutableLast() = number;
            numbers.back() = number;
        } else if (number % 4 == 0) {
            list.clear();
            numbers.clear();
        }
    }
};

RC_GTEST_PROP(EntryList, familyOfCopiesBehavesAsVectorsDo, ())
{
    std::vector<Pair> family(1);
    const int steps = *rc::gen::inRange(0, 200);
    for (int step = 0; step < steps; ++step) {
        const auto member = *rc::gen::inRange<std::size_t>(0, family.size());
        switch (*rc::gen::inRange(0, 8)) {
        case 0:
            family.push_back(Pair(family[member]));
            break;
        case 1:
            family[member] = Pair(family.back());
            break;
        default:
            family[member].changeAtRandom();
        }
        for (const Pair &pair : family)
            RC_ASSERT(contents(pair.list) == pair.numbers);
    }
}

} // namespace
} // namespace penwick::test
