// SPDX-License-Identifier: MIT
// Which keys mean what, whoever gets them.
#include "toolpanel/ToolKeys.h"

#include "appearance/Theme.h"

#include <QKeyEvent>

#include <gtest/gtest.h>

namespace penwick::test {

namespace {

QKeyEvent press(int key, Qt::KeyboardModifiers modifiers = {})
{
    return { QEvent::KeyPress, key, modifiers };
}

} // namespace

TEST(ToolKeys, lettersAndDigitsAreTyped)
{
    for (const int key : { Qt::Key_A, Qt::Key_M, Qt::Key_Z, Qt::Key_0, Qt::Key_5, Qt::Key_9 })
        EXPECT_TRUE(isTyped(press(key))) << key;
    // What lies next to them.
    for (const int key : { Qt::Key_At, Qt::Key_BracketLeft, Qt::Key_Slash, Qt::Key_Colon })
        EXPECT_FALSE(isTyped(press(key))) << key;
}

TEST(ToolKeys, keysOfTheDesktopAreNotTyped)
{
    for (const auto modifier : { Qt::ControlModifier, Qt::AltModifier, Qt::MetaModifier }) {
        EXPECT_FALSE(isTyped(press(Qt::Key_E, modifier))) << modifier;
        EXPECT_EQ(optionForKey(press(Qt::Key_4, modifier)), -1) << modifier;
        EXPECT_EQ(toolForKey(press(Qt::Key_E, modifier)), QString()) << modifier;
    }
    EXPECT_TRUE(isTyped(press(Qt::Key_E, Qt::ShiftModifier)));
}

TEST(ToolKeys, oneToNineAreOptionsCountedFromZero)
{
    EXPECT_EQ(optionForKey(press(Qt::Key_1)), 0);
    EXPECT_EQ(optionForKey(press(Qt::Key_9)), 8);
    EXPECT_EQ(optionForKey(press(Qt::Key_0)), -1);
    EXPECT_EQ(optionForKey(press(Qt::Key_Colon)), -1);
}

TEST(ToolKeys, toolsHaveTheirKeys)
{
    EXPECT_EQ(toolForKey(press(Qt::Key_B)), Tools::brush);
    EXPECT_EQ(toolForKey(press(Qt::Key_T)), Tools::text);
    EXPECT_EQ(toolForKey(press(Qt::Key_E)), Tools::eraser);
    EXPECT_EQ(toolForKey(press(Qt::Key_C)), Tools::color);
    EXPECT_EQ(toolForKey(press(Qt::Key_Y)), QString());
    EXPECT_EQ(toolForKey(press(Qt::Key_Z, Qt::ControlModifier)), Tools::undo);
    EXPECT_EQ(toolForKey(press(Qt::Key_Y, Qt::ControlModifier)), Tools::redo);
    EXPECT_EQ(toolForKey(press(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier)), Tools::redo);
    EXPECT_EQ(toolForKey(press(Qt::Key_W, Qt::ControlModifier)), Tools::state);
    EXPECT_EQ(toolForKey(press(Qt::Key_Delete, Qt::ControlModifier)), Tools::clear);
    EXPECT_EQ(toolForKey(press(Qt::Key_Delete)), QString());
}

} // namespace penwick::test
