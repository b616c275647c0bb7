// SPDX-License-Identifier: MIT
// The kinds of window by their raw values.
#include <penwick/WindowType.h>

#include <gtest/gtest.h>

#include <limits>
#include <type_traits>
#include <unordered_set>

namespace penwick::test {

TEST(WindowType, rawValuesAreZeroToTwo)
{
    EXPECT_EQ(static_cast<std::uintptr_t>(WindowType::whiteboard), 0U);
    EXPECT_EQ(static_cast<std::uintptr_t>(WindowType::annotation), 1U);
    EXPECT_EQ(static_cast<std::uintptr_t>(WindowType::imageAnnotation), 2U);
    EXPECT_TRUE((std::is_same_v<std::underlying_type_t<WindowType>, std::uintptr_t>));
}

TEST(WindowType, isMadeFromItsRawValue)
{
    EXPECT_EQ(windowTypeFromRawValue(0), WindowType::whiteboard);
    EXPECT_EQ(windowTypeFromRawValue(1), WindowType::annotation);
    EXPECT_EQ(windowTypeFromRawValue(2), WindowType::imageAnnotation);
}

TEST(WindowType, anyOtherRawValueIsNone)
{
    EXPECT_EQ(windowTypeFromRawValue(3), std::nullopt);
    EXPECT_EQ(windowTypeFromRawValue(4), std::nullopt);
    EXPECT_EQ(windowTypeFromRawValue(std::numeric_limits<std::uintptr_t>::max()), std::nullopt);
}

TEST(WindowType, isHashedByItsRawValue)
{
    const std::unordered_set<WindowType> types { WindowType::whiteboard, WindowType::annotation,
        WindowType::annotation };

    EXPECT_EQ(types.size(), 2U);
    EXPECT_EQ(types.count(WindowType::imageAnnotation), 0U);
}

} // namespace penwick::test
