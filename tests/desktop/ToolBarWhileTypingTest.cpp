// SPDX-License-Identifier: MIT
// Presses on the tool bar while a text box is edited: the tool hears of them, and only the text
// tool takes the keys from the box.
#include "desktop/support/ToolBarFixture.h"

namespace penwick::desktop {

namespace {

class ToolBarWhileTyping : public ToolBarTest
{
protected:
    ToolBarWhileTyping()
    {
        open();
        press("text");
        click({ 300, 150 });
        type("aa");
    }

    void type(const char *text)
    {
        desktop().keyboard().type(text);
        require([&] { return inked().width() > m_width; }, "what was typed to appear");
        m_width = inked().width();
    }

    /// The extent of the text and its caret, inside the box's border.
    QRect inked()
    {
        QRect found;
        const QRect area(305, 148, 190, 30);
        const QImage image = desktop().screen().picture(area.translated(canvas().topLeft()));
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (image.pixelColor(x, y).blue() < 130)
                    found |= QRect(x, y, 1, 1);
            }
        }
        return found;
    }

    int m_width = 0;
};

} // namespace

TEST_F(ToolBarWhileTyping, anotherToolIsChosenAndTheBoxKeepsTheKeys)
{
    for (const char *const tool : { "eraser", "brush" }) {
        press(tool);
        EXPECT_TRUE(turns(tool, selected)) << tool;
        type("mm");
    }
}

TEST_F(ToolBarWhileTyping, colourIsChosenAndTheBoxKeepsTheKeys)
{
    press("color");
    choose("color#red");
    EXPECT_TRUE(isPopoverHidden());

    type("mm");
}

TEST_F(ToolBarWhileTyping, keysOfUndoAndRedoAreTheEditorsOwn)
{
    constexpr int caret = 4;
    const int width = m_width;

    desktop().keyboard().pressWith("Control_L", "z");
    EXPECT_TRUE(waitUntil([&] { return inked().width() <= caret; }));
    desktop().keyboard().pressWith("Control_L", "y");
    EXPECT_TRUE(waitUntil([&] { return inked().width() >= width - caret; }));
    desktop().keyboard().pressWith("Control_L", "z");
    EXPECT_TRUE(waitUntil([&] { return inked().width() <= caret; }));
}

TEST_F(ToolBarWhileTyping, typingOnAfterTheEditChoosesNoTool)
{
    desktop().keyboard().press("Return");
    desktop().keyboard().type("be");
    desktop().keyboard().pressWith("Control_L", "z"); // takes the box away, after the letters

    EXPECT_TRUE(waitUntil([&] { return inked().isNull(); }));
    EXPECT_TRUE(turns("text", selected));
    EXPECT_TRUE(turns("brush", normal));
    EXPECT_TRUE(turns("eraser", normal));

    desktop().pointer().click(onScreen({ 600, 300 })); // a box, which is left by its key
    desktop().keyboard().press("Return");
    press("brush");
    desktop().keyboard().type("e");
    EXPECT_TRUE(turns("eraser", selected));
}

TEST_F(ToolBarWhileTyping, keyThatClosesWindowsIsTheEditorsOwn)
{
    desktop().keyboard().pressWith("Control_L", "w");

    type("mm");
    EXPECT_TRUE(host().window(QStringLiteral("drawing")).isVisible);
}

TEST_F(ToolBarWhileTyping, textToolTakesTheKeys)
{
    press("text");
    static_cast<void>(popover());
    const int width = m_width;

    desktop().keyboard().type("mm");
    press("text");
    EXPECT_TRUE(isPopoverHidden());

    // The next click makes another box, in which the keys are again.
    click({ 600, 300 });
    EXPECT_NEAR(inked().width(), width, 5); // the caret may be gone
}

} // namespace penwick::desktop
