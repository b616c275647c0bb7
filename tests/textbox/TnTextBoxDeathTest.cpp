// SPDX-License-Identifier: MIT
// What stops the process when a text box is used.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

namespace penwick::test {
namespace {

using TnTextBoxDeathTest = TextBoxFixture;

const char *const noDelegate
    = "penwick: fatal error: a text box that deletes itself has no delegate";

TEST_F(TnTextBoxDeathTest, deleteButtonWithoutADelegateStopsTheProcess)
{
    const auto box = placedBox();
    box->setTextBoxDelegate(nullptr);

    EXPECT_DEATH(box->deleteTextBox(), noDelegate);
}

TEST_F(TnTextBoxDeathTest, backspaceWithoutADelegateStopsTheProcess)
{
    const auto box = placedBox();
    box->setTextBoxDelegate(nullptr);

    EXPECT_DEATH(box->keyUp({ platform::KeyEvent::backspaceKeyCode }), noDelegate);
}

TEST_F(TnTextBoxDeathTest, leavingAnEmptyBoxWithoutADelegateStopsTheProcess)
{
    const auto box = newBox();
    box->setTextBoxDelegate(nullptr);

    EXPECT_DEATH(contentOf(window).makeFirstResponder(canvas), noDelegate);
}

TEST_F(TnTextBoxDeathTest, delegateThatIsGoneStopsTheProcess)
{
    const auto box = placedBox();
    {
        RecordingOwner owner;
        box->setTextBoxDelegate(&owner);
    }

    EXPECT_DEATH(box->deleteTextBox(), noDelegate);
}

TEST_F(TnTextBoxDeathTest, newBoxWithoutTheBundleStopsTheProcess)
{
    setPenwickBundle(nullptr);

    EXPECT_DEATH(static_cast<void>(TnTextBox::create({ 0, 0, 200, 30 }, 24.0, Qt::black)),
        "penwick: fatal error: the resource bundle is not set");
}

} // namespace
} // namespace penwick::test
