// SPDX-License-Identifier: MIT
// A choice in a popover: who hears of it, in which order, and what stays selected.
#include "toolpanel/ToolPanelFixture.h"

#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {

namespace {

using Log = std::vector<std::string>;

/// Writes down what it is told, and which options were selected then.
class Listener final : public QObject, public ToolSelectionDelegate, public ToolPanelOptionDelegate
{
public:
    explicit Listener(std::function<std::string()> state)
        : m_state(std::move(state))
    { }

    void handleToolSelection(const QString &selectedTool) override
    {
        m_log.push_back("tool " + selectedTool.toStdString());
    }
    void handleToolOptionSelection(const QString &selectedToolOption) override
    {
        m_log.push_back("option " + selectedToolOption.toStdString() + ", " + m_state());
    }
    void changeColorToolImage(const QString &newColorState) override
    {
        m_log.push_back("image " + newColorState.toStdString() + ", " + m_state());
    }

    [[nodiscard]] Log take() { return std::exchange(m_log, {}); }

private:
    std::function<std::string()> m_state;
    Log m_log;
};

class PopoverChoiceTest : public ToolPanelFixture
{
protected:
    [[nodiscard]] std::string state() const
    {
        return selectedOptions("color").join(QLatin1Char(' ')).toStdString()
            + (isPopoverShown() ? ", shown" : ", hidden");
    }

    void listen()
    {
        bar.popoverVc()->setToolPopoverDelegate(&m_listener);
        bar.popoverVc()->setToolPanelOptionDelegate(&m_listener);
    }

    Listener m_listener { [this] { return state(); } };
};

} // namespace

TEST_F(PopoverChoiceTest, colourIsToldToThePanelThenSelectedThenToldToTheDrawingThenClosed)
{
    press("color");
    listen();

    choose("color#red");

    EXPECT_EQ(m_listener.take(),
        (Log { "image color#red, color#black, shown", "option color#red, color#red, shown" }));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, colourReachesTheDrawingAndTheColourButton)
{
    press("color");

    choose("color#green");

    EXPECT_EQ(canvas().brushColor(), QColor(0, 203, 121));
    EXPECT_EQ(
        button("color").image().pixmap(24, 24).toImage().pixelColor(12, 12), QColor(0, 203, 121));
    EXPECT_EQ(selectedOptions("color"), only("color#green"));
    EXPECT_EQ(selected(), only("brush"));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, thicknessLeavesTheColourButtonAlone)
{
    press("brush");
    const qint64 image = button("color").image().cacheKey();

    choose("brush#12");

    EXPECT_EQ(canvas().brushThickness(), 12.0);
    EXPECT_EQ(button("color").image().cacheKey(), image);
    EXPECT_EQ(selectedOptions("brush"), only("brush#12"));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, sizeReachesTheDrawing)
{
    press("text");
    press("text");

    choose("text#48");

    EXPECT_EQ(canvas().textFontSize(), 48.0);
    EXPECT_EQ(selectedOptions("text"), only("text#48"));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, choiceIsStillSelectedWhenThePopoverOpensAgain)
{
    press("brush");
    choose("brush#8");
    press("color");
    choose("color#yellow");

    press("brush");

    EXPECT_TRUE(isPopoverShown());
    EXPECT_EQ(selectedOptions("brush"), only("brush#8"));
    EXPECT_EQ(lookOf(option(QStringLiteral("brush#8"))).image, Shown::AlternateImage);
    EXPECT_EQ(selectedOptions("color"), only("color#yellow"));
    EXPECT_EQ(selectedOptions("text"), only("text#24"));
}

TEST_F(PopoverChoiceTest, sameChoiceTwiceStaysSelected)
{
    press("brush");
    choose("brush#8");
    press("brush");
    choose("brush#8");

    EXPECT_EQ(selectedOptions("brush"), only("brush#8"));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, unknownKindDoesNothingAndStaysOpen)
{
    press("brush");
    listen();
    for (const char *const identifier : { "ruler", "ruler#3", "Brush#3", "#3" }) {
        ToolOptionsButton stranger(platform::Rect { 0, 0, 32, 32 });
        stranger.setIdentifier(QLatin1String(identifier));
        bar.popoverVc()->OnToolOptionSelection(stranger);
    }

    EXPECT_EQ(m_listener.take(), Log {});
    EXPECT_TRUE(isPopoverShown());
    EXPECT_EQ(selectedOptions("brush"), only("brush#5"));
}

TEST_F(PopoverChoiceTest, missingDelegatesAreSkipped)
{
    press("color");
    bar.popoverVc()->setToolPopoverDelegate(nullptr);
    bar.popoverVc()->setToolPanelOptionDelegate(nullptr);

    choose("color#red");

    EXPECT_EQ(selectedOptions("color"), only("color#red"));
    EXPECT_EQ(canvas().brushColor(), QColor(41, 41, 41));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(PopoverChoiceTest, delegatesThatDiedAreSkipped)
{
    press("color");
    {
        Listener brief([] { return std::string(); });
        bar.popoverVc()->setToolPopoverDelegate(&brief);
        bar.popoverVc()->setToolPanelOptionDelegate(&brief);
    }

    choose("color#red");

    EXPECT_EQ(bar.popoverVc()->toolPopoverDelegate(), nullptr);
    EXPECT_EQ(selectedOptions("color"), only("color#red"));
}

TEST_F(PopoverChoiceTest, missingWindowIsSkipped)
{
    press("color");
    bar.popoverVc()->setCurrentPopoverWindow(nullptr);

    choose("color#red");

    EXPECT_TRUE(isPopoverShown());
    EXPECT_EQ(canvas().brushColor(), QColor(255, 58, 104));
}

TEST_F(PopoverChoiceTest, resigningClosesThePopover)
{
    press("color");

    EXPECT_TRUE(bar.popoverVc()->resignFirstResponder());

    EXPECT_FALSE(isPopoverShown());
    bar.popoverVc()->setCurrentPopoverWindow(nullptr);
    EXPECT_TRUE(bar.popoverVc()->resignFirstResponder());
}

TEST_F(PopoverChoiceTest, popoverThatGivesTheKeysUpCloses)
{
    const std::vector<PopoverView *> views = popoverViews();
    const std::vector<const char *> tools { "text", "color", "brush" };
    press("text");
    for (std::size_t index = 0; index < views.size(); ++index) {
        if (!isPopoverShown())
            press(tools[index]);
        if (!isPopoverShown()) // the first press of a tool only chooses it
            press(tools[index]);
        ASSERT_EQ(contentOf(popover()).contentView(), views[index]);
        ASSERT_TRUE(contentOf(popover()).makeFirstResponder(views[index]));
        EXPECT_TRUE(isPopoverShown());

        EXPECT_TRUE(contentOf(popover()).makeFirstResponder(nullptr));
        EXPECT_FALSE(isPopoverShown()) << tools[index];
    }
}

TEST_F(PopoverChoiceTest, viewMadeInCodeHasItsFrame)
{
    const PopoverView view(platform::Rect { 3, 4, 50, 60 });

    EXPECT_EQ(view.frame(), (platform::Rect { 3, 4, 50, 60 }));
}

TEST_F(PopoverChoiceTest, popoverTakesItsColoursInTheWindow)
{
    for (PopoverView *const view : popoverViews()) {
        contentOf(popover()).setContentView(view);
        const platform::Layer *const layer = view->layer();

        ASSERT_NE(layer, nullptr);
        EXPECT_EQ(layer->backgroundColor, QColor(246, 248, 250));
        EXPECT_EQ(layer->borderColor, QColor(128, 128, 128));
        EXPECT_EQ(layer->borderWidth, 0.5);
        EXPECT_EQ(layer->cornerRadius, 2.0);
    }
}

} // namespace penwick::test
