// SPDX-License-Identifier: MIT
// The tool bar: as it opens, and what it does with what others tell it.
#include "toolpanel/ToolPanelFixture.h"

#include "appearance/PenwickBundle.h"
#include "appearance/Theme.h"
#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {

namespace {

class ToolPanel : public ToolPanelFixture
{
protected:
    /// Whether redo and undo can be pressed, in this order.
    [[nodiscard]] std::vector<bool> redoAndUndo() const
    {
        return { button("redo").isEnabled(), button("undo").isEnabled() };
    }

    void expectPainted(const QColor &endColor, const QColor &selectedColor)
    {
        EXPECT_EQ(button("state").backgroundColor(), endColor);
        EXPECT_EQ(button("brush").backgroundColor(), selectedColor);
        for (const char *const name : { "text", "eraser", "color", "clear", "redo", "undo" })
            EXPECT_EQ(button(name).backgroundColor(), TnhColors::toolPanelButtonColor) << name;
    }
};

} // namespace

TEST_F(ToolPanel, newControllerHasNothingButTheDefaultTool)
{
    const ToolPanelViewController controller;

    EXPECT_EQ(controller.selectedButtonId(), QStringLiteral("text"));
    EXPECT_EQ(controller.toolSelectionDelegate(), nullptr);
    EXPECT_EQ(controller.popoverVc(), nullptr);
    EXPECT_EQ(controller.popoverW(), nullptr);
    EXPECT_EQ(controller.visiblePopover(), std::nullopt);
    EXPECT_EQ(controller.button(QStringLiteral("text")), nullptr);
    EXPECT_EQ(controller.buttonMapping(), std::nullopt);
    EXPECT_EQ(controller.buttons(), std::nullopt);
    EXPECT_EQ(controller.lastSelectedTool(), nullptr);
    EXPECT_EQ(controller.lastSelectedButton(), nullptr);
    EXPECT_EQ(controller.currentSelectedButton(), nullptr);
}

TEST_F(ToolPanel, buttonsAreKeptByNameAndSevenInTheirOrder)
{
    ASSERT_TRUE(bar.buttonMapping() && bar.buttons());
    EXPECT_EQ(bar.buttonMapping()->size(), 8);
    QStringList repainted;
    for (const auto &each : *bar.buttons())
        repainted.append(each->identifier());

    EXPECT_EQ(repainted.join(QLatin1Char(' ')),
        QStringLiteral("text brush eraser color clear redo undo"));
}

TEST_F(ToolPanel, pressLeavesTheButtonsOfBeforeAndAfter)
{
    EXPECT_EQ(bar.lastSelectedButton(), &button("brush"));
    EXPECT_EQ(bar.currentSelectedButton(), &button("brush"));

    press("eraser");

    EXPECT_EQ(bar.lastSelectedButton(), &button("brush"));
    EXPECT_EQ(bar.currentSelectedButton(), &button("eraser"));
    EXPECT_EQ(bar.lastSelectedTool(), nullptr);
}

TEST_F(ToolPanel, whatIsAssignedIsKept)
{
    ToolPanelViewController controller;
    controller.setSelectedButtonId(QStringLiteral("brush"));
    controller.setVisiblePopover(PopoverChoice::brushpopover);
    controller.setLastSelectedTool(&button("text"));
    controller.setLastSelectedButton(&button("undo"));
    controller.setCurrentSelectedButton(&button("redo"));
    controller.setButtons(ToolPanelViewController::Buttons { &button("clear") });
    controller.setButtonMapping(
        ToolPanelViewController::ButtonMapping { { QStringLiteral("ruler"), &button("text") } });
    controller.setToolSelectionDelegate(&drawViewController());

    EXPECT_EQ(controller.selectedButtonId(), QStringLiteral("brush"));
    EXPECT_EQ(controller.visiblePopover(), PopoverChoice::brushpopover);
    EXPECT_EQ(controller.lastSelectedTool(), &button("text"));
    EXPECT_EQ(controller.lastSelectedButton(), &button("undo"));
    EXPECT_EQ(controller.currentSelectedButton(), &button("redo"));
    EXPECT_EQ(controller.buttons()->front(), &button("clear"));
    EXPECT_EQ(controller.button(QStringLiteral("ruler")), &button("text"));
    EXPECT_EQ(controller.button(QStringLiteral("text")), nullptr);
    EXPECT_EQ(controller.toolSelectionDelegate(), &drawViewController());
}

TEST_F(ToolPanel, assignedDelegateHearsOfThePressesAndItsCanvasSaysTheTool)
{
    class Other final : public QObject, public ToolSelectionDelegate, public DrawingCanvasDelegate
    {
    public:
        explicit Other(DrawViewController &drawing)
            : m_drawing(drawing)
        { }
        void handleToolSelection(const QString &selectedTool) override { heard += selectedTool; }
        void handleToolOptionSelection(const QString &) override { }
        void didBeginDrawing(platform::Point) override { }
        void drawPathOnCanvas(platform::Point, platform::Point) override { }
        void createTextBoxOnCanvas(platform::Point) override { }
        void didClearCanvas() override { }
        void updateDrawingCanvasElements() override { }
        void updateDrawingCanvasViewForDisplay() override { }
        [[nodiscard]] const std::shared_ptr<DrawingCanvasModel> &drawingCanvasModel() const override
        {
            return m_drawing.drawingCanvasModel();
        }
        [[nodiscard]] DrawingCanvasView *drawingView() const override
        {
            return m_drawing.drawingView();
        }

        QStringList heard;

    private:
        DrawViewController &m_drawing;
    };
    Other other(drawViewController());
    canvas().setCurrentSelectedTool(QStringLiteral("eraser"));

    bar.setToolSelectionDelegate(&other);
    press("text");

    EXPECT_EQ(other.heard, only("text"));
    EXPECT_EQ(bar.lastSelectedButton(), &button("eraser"));
    EXPECT_EQ(
        canvas().currentSelectedTool(), QStringLiteral("eraser")); // it was told, and nobody else
}

TEST_F(ToolPanel, popoverWindowHasItsContentControllerFromTheStart)
{
    EXPECT_EQ(contentOf(popover()).contentViewController(), bar.popoverVc());
    EXPECT_EQ(contentOf(popover()).contentView(), bar.popoverVc()->textPopoverView());
    EXPECT_FALSE(isPopoverShown());

    press("color");
    EXPECT_EQ(contentOf(popover()).contentViewController(), bar.popoverVc());
    EXPECT_EQ(contentOf(popover()).contentView(), bar.popoverVc()->colorPopoverView());

    const QPointer<PopoverViewController> popovers = bar.popoverVc();
    m_board.reset();
    m_penwick.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(popovers, nullptr);
}

TEST_F(ToolPanel, everyButtonIsFoundByItsIdentifier)
{
    for (const QString &name : toolNames()) {
        ASSERT_NE(bar.button(name), nullptr) << name.toStdString();
        EXPECT_EQ(bar.button(name)->identifier(), name);
    }
    EXPECT_EQ(bar.button(QStringLiteral("handle")), nullptr);
}

TEST_F(ToolPanel, outletsAreTheButtonsOfTheirNames)
{
    const ToolPanelOutlets &outlets = bar.outlets();

    EXPECT_EQ(outlets.textButton, &button("text"));
    EXPECT_EQ(outlets.brushButton, &button("brush"));
    EXPECT_EQ(outlets.eraserButton, &button("eraser"));
    EXPECT_EQ(outlets.colorButton, &button("color"));
    EXPECT_EQ(outlets.clearButton, &button("clear"));
    EXPECT_EQ(outlets.stateButton, &button("state"));
    EXPECT_EQ(outlets.redoButton, &button("redo"));
    EXPECT_EQ(outlets.undoButton, &button("undo"));
    EXPECT_NE(outlets.toolBarHandle, nullptr);
    EXPECT_NE(outlets.toolPanelView, nullptr);
}

TEST_F(ToolPanel, opensWithTheCanvasesToolSelectedAndNothingToUndo)
{
    EXPECT_EQ(selected(), only("brush"));
    EXPECT_EQ(bar.selectedButtonId(), QStringLiteral("brush"));
    EXPECT_EQ(lookOf(button("brush")),
        (ButtonLook { { 18, 168, 241 }, Shown::AlternateImage, whiteTriangle }));
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { false, false }));
    EXPECT_FALSE(isPopoverShown());
    EXPECT_EQ(bar.visiblePopover(), std::nullopt);
}

TEST_F(ToolPanel, joinsTheDrawingItsPopoversAndItself)
{
    EXPECT_EQ(bar.toolSelectionDelegate(), &drawViewController());
    EXPECT_EQ(bar.popoverVc()->toolPopoverDelegate(), &drawViewController());
    EXPECT_EQ(bar.popoverVc()->toolPanelOptionDelegate(), &bar);
    EXPECT_EQ(bar.popoverVc()->currentPopoverWindow(), &popover());
    EXPECT_EQ(canvas().popoverWindow(), &popover());
}

TEST_F(ToolPanel, popoverWindowHasItsAttributes)
{
    const platform::WindowAttributes &attributes = popover().attributes();

    EXPECT_EQ(attributes.styleMask.toInt(), 4096U);
    EXPECT_EQ(attributes.sharingType, platform::SharingType::none);
    EXPECT_EQ(attributes.titleVisibility, platform::TitleVisibility::hidden);
    EXPECT_TRUE(attributes.titlebarAppearsTransparent);
    EXPECT_FALSE(attributes.showsToolbarButton);
    EXPECT_FALSE(attributes.isMovable);
    EXPECT_EQ(attributes.backgroundColor.alpha(), 0);
    EXPECT_EQ(attributes.level, panel.attributes().level);
    EXPECT_EQ(attributes.animationBehavior, platform::AnimationBehavior::utilityWindow);
    EXPECT_EQ(popover().frame().size(), bar.popoverVc()->view()->frame().size());
}

TEST_F(ToolPanel, isPaintedInItsColours)
{
    const platform::Layer &body = *bar.outlets().toolPanelView->layer();
    EXPECT_EQ(body.backgroundColor, QColor(246, 248, 250));
    EXPECT_EQ(body.borderColor, QColor(128, 128, 128));
    EXPECT_EQ(body.borderWidth, 0.7);
    EXPECT_EQ(body.cornerRadius, 4.0);
    EXPECT_EQ(bar.outlets().toolBarHandle->layer()->backgroundColor, QColor(203, 210, 218));
    EXPECT_TRUE(bar.view()->wantsLayer());
    EXPECT_EQ(button("state").layer()->cornerRadius, 2.0);
    expectPainted({ 239, 71, 111 }, { 18, 168, 241 });
}

TEST_F(ToolPanel, endButtonSaysEndInWhiteAndInItsMiddle)
{
    const platform::AttributedString &title = button("state").attributedTitle();

    EXPECT_EQ(title.string, QStringLiteral("END"));
    EXPECT_EQ(title.foregroundColor, QColor(Qt::white));
    EXPECT_TRUE(title.alignment.testFlag(Qt::AlignHCenter));
    const QImage picture = paintedBy(button("state"));
    EXPECT_GT(qGreen(picture.pixel(0, 14)), 0); // there is a background up to the edge
}

TEST_F(ToolPanel, contrastThatChangesRepaintsAllEightButtons)
{
    m_contrast.setIncreased(true);
    expectPainted({ 190, 41, 76 }, { 7, 69, 149 });

    m_contrast.setIncreased(false);
    expectPainted({ 239, 71, 111 }, { 18, 168, 241 });
}

TEST_F(ToolPanel, historyEnablesUndoAndRedo)
{
    post(QVariantMap { { QStringLiteral("enableUndo"), true } });
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { false, true }));

    post(QVariantMap { { QStringLiteral("enableRedo"), true } });
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { true, true }));

    post(QVariantMap { { QStringLiteral("enableUndo"), false } });
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { true, false }));
}

TEST_F(ToolPanel, oneNotificationMaySayBoth)
{
    post(QVariantMap {
        { QStringLiteral("enableUndo"), true }, { QStringLiteral("enableRedo"), true } });

    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { true, true }));
}

TEST_F(ToolPanel, notificationWithAnotherObjectIsIgnored)
{
    post(QVariantMap { { QStringLiteral("enableUndo"), true } });

    post({});
    post(false);
    post(QStringLiteral("enableUndo"));
    post(QVariantMap());
    post(QVariantMap { { QStringLiteral("enableUndo"), 0 } });
    post(QVariantMap { { QStringLiteral("enableUndo"), QStringLiteral("false") } });
    post(QVariantMap { { QStringLiteral("enableUndo"), false }, { QStringLiteral("other"), 1 } });
    post(QVariantMap { { QStringLiteral("other"), false } });

    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { false, true }));
}

TEST_F(ToolPanel, barThatIsGoneHearsNothing)
{
    m_board.reset();
    m_penwick.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

    post(QVariantMap { { QStringLiteral("enableUndo"), true } });
    m_contrast.setIncreased(true);
}

TEST_F(ToolPanel, namedColourImageComesToTheColourButton)
{
    bar.changeColorToolImage(QStringLiteral("color#red"));

    const QImage shown = button("color").image().pixmap(24, 24).toImage();
    const QImage wanted
        = penwickBundle()->imageForResource(QStringLiteral("color#red")).pixmap(24, 24).toImage();
    EXPECT_EQ(shown, wanted);
    EXPECT_EQ(shown.pixelColor(12, 12), QColor(255, 58, 104));
}

TEST_F(ToolPanel, colourWithoutAnImageLeavesTheButtonWithoutOne)
{
    bar.changeColorToolImage(QStringLiteral("color#pink"));

    EXPECT_TRUE(button("color").image().isNull());
}

TEST_F(ToolPanel, colourButtonIsBlackFromTheStart)
{
    EXPECT_EQ(
        button("color").image().pixmap(24, 24).toImage().pixelColor(12, 12), QColor(41, 41, 41));
}

TEST_F(ToolPanel, appearingAgainTakesTheCanvasesToolOver)
{
    press("eraser");
    post(QVariantMap { { QStringLiteral("enableUndo"), true } });
    canvas().setCurrentSelectedTool(QStringLiteral("text"));
    button("eraser").setIsSelected(false);

    panel.orderOut();
    panel.orderFront();

    EXPECT_EQ(selected(), only("text"));
    EXPECT_EQ(bar.selectedButtonId(), QStringLiteral("text"));
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { false, false }));
}

TEST_F(ToolPanel, comingBackWithItsWindowIsNoAppearing)
{
    post(QVariantMap { { QStringLiteral("enableUndo"), true } });

    drawing.orderOut();
    drawing.orderFront();

    EXPECT_TRUE(panel.isVisible());
    EXPECT_EQ(redoAndUndo(), (std::vector<bool> { false, true }));
}

TEST_F(ToolPanel, unknownToolOfTheCanvasSelectsNothing)
{
    canvas().setCurrentSelectedTool(QStringLiteral("ruler"));
    button("brush").setIsSelected(false);

    panel.orderOut();
    panel.orderFront();

    EXPECT_EQ(selected(), QStringList());
}

} // namespace penwick::test
