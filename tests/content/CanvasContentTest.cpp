// SPDX-License-Identifier: MIT
// The two arrays of a canvas are values: what was read stays what it was.
#include "content/CanvasContent.h"

#include <gtest/gtest.h>

#include <vector>

namespace penwick {

// Content never looks inside a text box, so any class will do here.
class TnTextBox
{ };

namespace test {
namespace {

class Content final : public CanvasContent
{ };

EntryList<StrokeEntry> strokesOf(const std::vector<std::int64_t> &identifiers)
{
    EntryList<StrokeEntry> strokes;
    for (const std::int64_t identifier : identifiers)
        strokes.append({ std::make_shared<platform::BezierPath>(), {}, identifier });
    return strokes;
}

std::vector<std::int64_t> idsOf(const EntryList<StrokeEntry> &strokes)
{
    std::vector<std::int64_t> identifiers;
    for (const StrokeEntry &entry : strokes)
        identifiers.push_back(entry.pathId);
    return identifiers;
}

using Ids = std::vector<std::int64_t>;

TEST(CanvasContent, newContentIsEmpty)
{
    const Content content;

    EXPECT_TRUE(content.pathArray().isEmpty());
    EXPECT_TRUE(content.textBoxArray().isEmpty());
}

TEST(CanvasContent, assigningAnArrayLeavesEarlierCopiesAndTheOtherArrayAlone)
{
    Content content;
    content.setPathArray(strokesOf({ 1, 2 }));
    EntryList<TextBoxEntry> boxes;
    boxes.append({ 7, std::make_shared<TnTextBox>() });
    content.setTextBoxArray(boxes);
    const EntryList<StrokeEntry> before = content.pathArray();

    EntryList<StrokeEntry> changed = content.pathArray();
    changed.removeAt(0);
    changed.append(strokesOf({ 3 }).last());
    EXPECT_EQ(idsOf(content.pathArray()), (Ids { 1, 2 }));
    content.setPathArray(changed);

    EXPECT_EQ(idsOf(content.pathArray()), (Ids { 2, 3 }));
    EXPECT_EQ(idsOf(before), (Ids { 1, 2 }));
    ASSERT_EQ(content.textBoxArray().size(), 1);
    EXPECT_EQ(content.textBoxArray().last().textId, 7);
    EXPECT_EQ(content.textBoxArray().last().textBox, boxes.last().textBox);
}

} // namespace
} // namespace test
} // namespace penwick
