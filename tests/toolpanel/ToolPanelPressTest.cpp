// SPDX-License-Identifier: MIT
// Presses on the tool bar: which button is selected after each, and which popover is shown.
#include "toolpanel/ToolPanelFixture.h"

#include "canvas/DrawingCanvasModel.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {

namespace {

class ToolPanelPress : public ToolPanelFixture
{
protected:
    struct Outcome
    {
        QStringList selected;
        QString tool; // of the canvas
        bool isPopoverShown;

        friend bool operator==(const Outcome &, const Outcome &) = default;
        friend void PrintTo(const Outcome &outcome, std::ostream *stream)
        {
            *stream << outcome.selected.join(QLatin1Char(' ')).toStdString() << "; "
                    << outcome.tool.toStdString() << "; popover " << outcome.isPopoverShown;
        }
    };

    Outcome outcomeOf(const char *identifier)
    {
        press(identifier);
        return { selected(), canvas().currentSelectedTool(), isPopoverShown() };
    }

    static Outcome outcome(const char *selected, const char *tool, bool isPopoverShown = false)
    {
        return { only(selected), QLatin1String(tool), isPopoverShown };
    }

    [[nodiscard]] platform::Point popoverOrigin() const { return popover().frame().origin(); }
};

class PressThatRestores : public ToolPanelFixture, public testing::WithParamInterface<const char *>
{ };

std::string toolName(const testing::TestParamInfo<const char *> &tool)
{
    return tool.param;
}

} // namespace

TEST_F(ToolPanelPress, textSelectsThenOpensThenCloses)
{
    EXPECT_EQ(outcomeOf("text"), outcome("text", "text"));
    EXPECT_EQ(outcomeOf("text"), outcome("text", "text", true));
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::textpopover);
    EXPECT_EQ(outcomeOf("text"), outcome("text", "text"));
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::textpopover); // hiding does not change it
}

TEST_F(ToolPanelPress, brushThatIsTheToolOpensAtOnceAndCloses)
{
    EXPECT_EQ(outcomeOf("brush"), outcome("brush", "brush", true));
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::brushpopover);
    EXPECT_EQ(outcomeOf("brush"), outcome("brush", "brush"));
    EXPECT_EQ(outcomeOf("brush"), outcome("brush", "brush", true));
}

TEST_F(ToolPanelPress, anotherToolHidesThePopover)
{
    press("brush");
    EXPECT_EQ(outcomeOf("text"), outcome("text", "text"));
    press("text");
    EXPECT_EQ(outcomeOf("eraser"), outcome("eraser", "eraser"));
    EXPECT_EQ(outcomeOf("eraser"), outcome("eraser", "eraser"));
}

TEST_F(ToolPanelPress, colourOpensWithThePreviousToolSelected)
{
    EXPECT_EQ(outcomeOf("color"), outcome("brush", "brush", true));
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::colorpopover);
}

TEST_F(ToolPanelPress, colourThatClosesStaysSelected)
{
    press("color");

    EXPECT_EQ(outcomeOf("color"), outcome("color", "brush"));
}

TEST_F(ToolPanelPress, toolAfterColourThatStayedSelectedLeavesBothSelected)
{
    press("color");
    press("color");

    // The button that was left selected is not the canvas's tool's.
    EXPECT_EQ(outcomeOf("eraser").selected,
        (QStringList { QStringLiteral("eraser"), QStringLiteral("color") }));
}

TEST_F(ToolPanelPress, colourHidesAnotherPopoverAndStaysSelected)
{
    press("brush");

    EXPECT_EQ(outcomeOf("color"), outcome("color", "brush"));
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::brushpopover);
}

TEST_P(PressThatRestores, hidesThePopoverAndSelectsThePreviousTool)
{
    // Something to undo, so that no button is disabled.
    post(QVariantMap {
        { QStringLiteral("enableUndo"), true }, { QStringLiteral("enableRedo"), true } });
    press("eraser");
    press("color");
    ASSERT_TRUE(isPopoverShown());

    press(GetParam());

    EXPECT_FALSE(isPopoverShown());
    EXPECT_EQ(selected(), only("eraser"));
    EXPECT_EQ(lookOf(button("eraser")),
        (ButtonLook { { 18, 168, 241 }, Shown::AlternateImage, whiteTriangle }));
    EXPECT_EQ(lookOf(button(GetParam())),
        (ButtonLook { { 246, 248, 250 }, Shown::Image, normalTriangle }));
    EXPECT_EQ(canvas().currentSelectedTool(), QStringLiteral("eraser"));
    EXPECT_EQ(bar.selectedButtonId(), QLatin1String(GetParam()));
}

INSTANTIATE_TEST_SUITE_P(
    Tools, PressThatRestores, testing::Values("clear", "undo", "redo"), toolName);

TEST_F(ToolPanelPress, undoAndRedoReachTheHistory)
{
    auto &model = *drawViewController().drawingCanvasModel();
    model.createPathWithParam(Qt::black, 5.0, { 300, 300 });

    press("undo");
    EXPECT_TRUE(model.pathArray().isEmpty());
    EXPECT_TRUE(button("redo").isEnabled());

    press("redo");
    EXPECT_EQ(model.pathArray().size(), 1);
}

TEST_F(ToolPanelPress, clearReachesTheModel)
{
    auto &model = *drawViewController().drawingCanvasModel();
    model.createPathWithParam(Qt::black, 5.0, { 300, 300 });
    drawViewController().updateDrawingCanvasElements();

    press("clear");

    EXPECT_TRUE(model.pathArray().isEmpty());
}

TEST_F(ToolPanelPress, historyIsHeardOnlyAfterTheSelectionWasRestored)
{
    drawViewController().drawingCanvasModel()->createPathWithParam(Qt::black, 5.0, { 300, 300 });
    QStringList seen;
    platform::NotificationCenter::defaultCenter().addObserver(
        &seen, penwickNotificationKey(), [&](const auto &) { seen += selected(); });

    press("undo");

    platform::NotificationCenter::defaultCenter().removeObserver(&seen);
    ASSERT_FALSE(seen.isEmpty());
    for (const QString &name : seen)
        EXPECT_EQ(name, QStringLiteral("brush"));
}

TEST_F(ToolPanelPress, doubleClickIsTwoPresses)
{
    QTest::mouseClick(&button("text"), Qt::LeftButton);
    QTest::mouseDClick(&button("text"), Qt::LeftButton); // only the second press of one
    QTest::mouseRelease(&button("text"), Qt::LeftButton);

    EXPECT_EQ(canvas().currentSelectedTool(), QStringLiteral("text"));
    EXPECT_TRUE(isPopoverShown());
}

TEST_F(ToolPanelPress, disabledOneDoesNothing)
{
    press("color");

    EXPECT_EQ(outcomeOf("undo"), outcome("brush", "brush", true));
}

TEST_F(ToolPanelPress, endClosesTheWindowAndStaysSelected)
{
    std::vector<QVariant> ends;
    platform::NotificationCenter::defaultCenter().addObserver(&ends,
        penwickSessionEndNotificationKey(),
        [&ends](const platform::Notification &end) { ends.push_back(end.object); });
    press("color");

    press("state");

    platform::NotificationCenter::defaultCenter().removeObserver(&ends);
    EXPECT_EQ(selected(), only("state"));
    EXPECT_FALSE(isPopoverShown());
    EXPECT_FALSE(panel.isVisible());
    EXPECT_FALSE(drawing.isVisible());
    EXPECT_EQ(ends, std::vector<QVariant> { false });
}

TEST_F(ToolPanelPress, hostThatLetsGoAtTheEndTakesTheBarDown)
{
    const QPointer<ToolPanelButton> end = &button("state");
    platform::NotificationCenter::defaultCenter().addObserver(
        this, penwickSessionEndNotificationKey(), [this](const auto &) {
            m_board.reset();
            m_penwick.reset();
        });

    press("state");

    platform::NotificationCenter::defaultCenter().removeObserver(this);
    EXPECT_NE(end, nullptr); // not inside its own press
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(end, nullptr);
}

TEST_F(ToolPanelPress, unknownIdentifierPrintsDefaultAndReachesTheCanvas)
{
    ToolPanelButton stranger(platform::Rect { 0, 0, 32, 32 });
    stranger.setIdentifier(QStringLiteral("ruler"));
    press("color");

    testing::internal::CaptureStdout();
    bar.OnToolBarItemSelection(stranger);

    EXPECT_EQ(testing::internal::GetCapturedStdout(), "Default\nSelected tool Not Available\n");
    EXPECT_EQ(selected(), QStringList()); // the previous tool's button was turned off
    EXPECT_TRUE(isPopoverShown());
    EXPECT_EQ(canvas().currentSelectedTool(), QStringLiteral("ruler"));
}

// Where the popover is: 10 points and the button's own distance right of the panel's right edge,
// level with the button's bottom.

TEST_F(ToolPanelPress, popoverStandsBesideItsButton)
{
    const platform::Rect at = panel.frame();

    press("brush");
    EXPECT_EQ(popoverOrigin(), (platform::Point { at.x + 10 + 52 + 8, at.y + 292 }));
    EXPECT_EQ(button("brush").frame().origin(), (platform::Point { 8, 292 }));

    press("text");
    press("text");
    EXPECT_EQ(popoverOrigin(), (platform::Point { at.x + 70, at.y + button("text").frame().y }));

    press("text");
    press("color");
    EXPECT_EQ(popoverOrigin(), (platform::Point { at.x + 70, at.y + button("color").frame().y }));
}

TEST_F(ToolPanelPress, popoverFollowsThePanelToItsNextOpening)
{
    press("brush");
    press("brush");
    panel.setFrameOrigin({ 580, 300 });
    QCoreApplication::processEvents();

    press("brush");

    EXPECT_EQ(popoverOrigin(), (platform::Point { 650, 592 }));
}

TEST_F(ToolPanelPress, firstPopoverIsPutIntoTheWindowAsThePanelsChild)
{
    press("brush");

    EXPECT_EQ(contentOf(popover()).contentView(), bar.popoverVc()->brushPopoverView());
    EXPECT_EQ(popover().parentWindow(), &panel);
    EXPECT_TRUE(bar.popoverVc()->brushPopoverView()->widget().isVisible());
}

TEST_F(ToolPanelPress, otherPopoverTakesItsPlaceInTheWindow)
{
    press("brush");
    press("brush");

    press("color");

    EXPECT_EQ(contentOf(popover()).contentView(), bar.popoverVc()->colorPopoverView());
    EXPECT_TRUE(bar.popoverVc()->colorPopoverView()->widget().isVisible());
    EXPECT_FALSE(bar.popoverVc()->brushPopoverView()->widget().isVisible());
    EXPECT_EQ(panel.childWindows(), std::vector<platform::Window *> { &popover() });
    EXPECT_EQ(bar.visiblePopover(), PopoverChoice::colorpopover);
}

TEST_F(ToolPanelPress, samePopoverIsOnlyShownAgain)
{
    press("color");
    contentOf(popover()).setContentView(bar.popoverVc()->textPopoverView());
    press("color");

    press("color");

    // Had it been put in again, this would be the colours' view.
    EXPECT_EQ(contentOf(popover()).contentView(), bar.popoverVc()->textPopoverView());
    EXPECT_TRUE(isPopoverShown());
}

TEST_F(ToolPanelPress, eraserEndOfAPenOnTheCanvasIsShownAsAPressOnTheEraserUntilTheTipIsBack)
{
    press("text");
    press("text"); // its popover
    const auto putDown = [this](platform::PenEnd end) {
        canvas().mouseDown({ { 50, 50 }, 1, end });
        canvas().mouseUp({ { 50, 50 }, 1, end });
        return Outcome { selected(), canvas().currentSelectedTool(), isPopoverShown() };
    };

    EXPECT_EQ(putDown(platform::PenEnd::Eraser), outcome("eraser", "eraser"));
    EXPECT_EQ(bar.selectedButtonId(), QStringLiteral("eraser"));
    EXPECT_EQ(putDown(platform::PenEnd::Eraser), outcome("eraser", "eraser"));
    EXPECT_EQ(putDown(platform::PenEnd::Tip), outcome("text", "text")); // and no popover
    EXPECT_EQ(putDown(platform::PenEnd::Tip), outcome("text", "text"));
}

} // namespace penwick::test
