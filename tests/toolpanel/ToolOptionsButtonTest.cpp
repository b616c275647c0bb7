// SPDX-License-Identifier: MIT
// Option buttons: their colours, and one of many selected.
#include "toolpanel/ToolOptionsButton.h"
#include "appearance/Theme.h"
#include "platform/view/PlainView.h"
#include "toolpanel/ButtonLook.h"
#include "toolpanel/ContrastSetting.h"
#include "toolpanel/PopoverView.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace penwick::test {

namespace {

using State = platform::Button::State;

const QColor normal { 246, 248, 250 };
const QColor hovered { 203, 210, 218 };

std::shared_ptr<ToolOptionsButton> makeOption()
{
    auto option = platform::makeView<ToolOptionsButton>(platform::Rect { 0, 0, 32, 32 });
    option->setImage(iconOf(Qt::black));
    option->setAlternateImage(iconOf(Qt::white));
    option->awakeFromScene();
    return option;
}

class ToolOptionsButtonTest : public testing::Test
{
protected:
    [[nodiscard]] ButtonLook look() const { return lookOf(*m_option); }

    ContrastSetting m_contrast;
    std::shared_ptr<ToolOptionsButton> m_option = makeOption();
};

/// A popover with a grid of three options.
class OptionGroup : public testing::Test
{
protected:
    OptionGroup()
    {
        m_popover.addSubview(m_grid);
        for (int count = 0; count < 3; ++count) {
            m_options.push_back(makeOption());
            m_grid->addSubview(m_options.back());
        }
    }

    /// What a press on the option number `index` does.
    void choose(std::size_t index)
    {
        m_options[index]->setState(State::On);
        m_options[index]->toogleButtonState(m_popover, PopoverChoice::brushpopover);
    }

    [[nodiscard]] std::vector<bool> selected() const
    {
        std::vector<bool> selected;
        for (const auto &option : m_options)
            selected.push_back(option->isSelected());
        return selected;
    }

    ContrastSetting m_contrast;
    PopoverView m_popover;
    std::shared_ptr<platform::PlainView> m_grid = platform::makeView<platform::PlainView>();
    std::vector<std::shared_ptr<ToolOptionsButton>> m_options;
};

using OptionGroupDeathTest = OptionGroup;

} // namespace

TEST_F(ToolOptionsButtonTest, coloursAreTheOptionsOwn)
{
    const ToolPanelButton &button = *m_option;

    EXPECT_EQ(button.hoverBackgroundColor(), TnhColors::toolOptionButtonHoverColor);
    EXPECT_EQ(button.originalBackgroundColor(), TnhColors::toolOptionButtonColor);
}

TEST_F(ToolOptionsButtonTest, pointerChangesTheBackgroundAlone)
{
    m_option->toggleToolState();

    m_option->mouseEntered();

    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::Image, normalTriangle }));
}

TEST_F(ToolOptionsButtonTest, pointerChangesADisabledOneToo)
{
    m_option->setEnabled(false);

    m_option->mouseEntered();

    EXPECT_EQ(m_option->backgroundColor(), hovered);
}

TEST_F(ToolOptionsButtonTest, pointerThatLeavesAnUnselectedOneMakesItNormal)
{
    m_option->mouseEntered();

    m_option->mouseExited();

    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolOptionsButtonTest, pointerThatLeavesASelectedOneChangesNothing)
{
    m_option->setIsSelected(true);
    m_option->toggleToolState();

    m_option->mouseExited();

    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, normalTriangle }));
}

TEST_F(ToolOptionsButtonTest, toggledSelectedHasTheAlternateImageAndIsTurnedOff)
{
    m_option->setState(State::On);
    m_option->setIsSelected(true);

    m_option->toggleToolState();

    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, normalTriangle }));
    EXPECT_EQ(m_option->state(), State::Off);
}

TEST_F(ToolOptionsButtonTest, toggledUnselectedIsNormalAndKeepsItsState)
{
    m_option->setState(State::On);

    m_option->toggleToolState();

    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
    EXPECT_EQ(m_option->state(), State::On);
}

TEST_F(ToolOptionsButtonTest, toggledColourIsNoSpecialCase)
{
    m_option->setIdentifier(QStringLiteral("color"));
    m_option->setIsSelected(true);

    m_option->toggleToolState();

    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, normalTriangle }));
}

TEST_F(ToolOptionsButtonTest, increasedContrastChangesNothing)
{
    m_contrast.setIncreased(true);

    m_option->mouseEntered();
    EXPECT_EQ(m_option->backgroundColor(), hovered);
    m_option->setIsSelected(true);
    m_option->toggleToolState();
    EXPECT_EQ(m_option->backgroundColor(), hovered);
}

TEST_F(OptionGroup, pressedOneIsTheOnlySelectedOne)
{
    choose(1);
    EXPECT_EQ(selected(), (std::vector<bool> { false, true, false }));
    EXPECT_EQ(
        lookOf(*m_options[1]), (ButtonLook { hovered, Shown::AlternateImage, normalTriangle }));

    choose(2);
    EXPECT_EQ(selected(), (std::vector<bool> { false, false, true }));
    EXPECT_EQ(lookOf(*m_options[1]), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(OptionGroup, statesAreOffAgainAfterAChoice)
{
    choose(0);

    for (const auto &option : m_options)
        EXPECT_EQ(option->state(), State::Off);
}

TEST_F(OptionGroup, selectedOneThatIsPressedAgainStaysSelected)
{
    choose(0);
    choose(0);

    EXPECT_EQ(selected(), (std::vector<bool> { true, false, false }));
}

TEST_F(OptionGroup, onlyTheFirstSubviewIsTheGrid)
{
    const auto other = platform::makeView<platform::PlainView>();
    m_popover.addSubview(other);
    const auto outside = makeOption();
    other->addSubview(outside);
    outside->setState(State::On);

    choose(0);

    EXPECT_FALSE(outside->isSelected());
}

TEST_F(OptionGroupDeathTest, popoverWithoutAGridStopsTheProcess)
{
    PopoverView empty;

    EXPECT_DEATH(m_options[0]->toogleButtonState(empty, PopoverChoice::textpopover),
        "penwick: fatal error: a popover has no option buttons");
}

TEST_F(OptionGroupDeathTest, somethingElseInTheGridStopsTheProcess)
{
    const auto other = platform::makeView<ToolPanelButton>(platform::Rect { 0, 0, 32, 32 });
    m_grid->addSubview(other);

    EXPECT_DEATH(choose(0), "penwick: fatal error: a popover holds more than option buttons");
}

} // namespace penwick::test
