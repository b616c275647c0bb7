// SPDX-License-Identifier: MIT
// The controller of a scene that holds a text box.
#include "textbox/TextBoxViewController.h"

#include "textbox/TextBoxFixture.h"

namespace penwick::test {
namespace {

using TextBoxViewControllerTest = TextBoxFixture;

TEST_F(TextBoxViewControllerTest, addsNothingToItsView)
{
    TextBoxViewController controllerOfBox;
    const auto box = newBox();
    const Rect before = box->frame();

    controllerOfBox.setView(*box);
    controllerOfBox.viewDidLoad();

    EXPECT_EQ(controllerOfBox.view(), box.get());
    EXPECT_EQ(box->frame(), before);
    EXPECT_TRUE(box->isEditable());
}

} // namespace
} // namespace penwick::test
