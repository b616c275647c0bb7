// SPDX-License-Identifier: MIT
#include "toolpanel/ToolPanelViewController.h"

#include "appearance/PenwickBundle.h"
#include "appearance/Theme.h"
#include "appearance/ViewBorder.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasView.h"
#include "history/NotificationNames.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/Placement.h"
#include "platform/foundation/StandardOutput.h"
#include "platform/view/OwnLook.h"
#include "platform/view/PlainView.h"
#include "platform/view/Workspace.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WorkArea.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolPanelButton.h"

#include <penwick/platform/Window.h>
#include <penwick/platform/WindowController.h>

namespace penwick {

namespace {

using platform::NotificationCenter;
using platform::require;

constexpr double panelBorderWidth = 0.7; // points
constexpr double endButtonRadius = 2.0; // points
constexpr double endFontSize = 12.0; // points
constexpr double popoverGap = 10.0; // points, between panel and popover

template <class View>
View &outlet(const QPointer<View> &view)
{
    return *require(view.data(), "an outlet of the tool panel is not connected");
}

} // namespace

ToolPanelViewController::ToolPanelViewController()
    : m_selectedButtonId(Tools::defaultSelectedTool)
{ }

ToolPanelViewController::~ToolPanelViewController()
{
    NotificationCenter::defaultCenter().removeObserver(this);
    platform::Workspace::shared().notificationCenter().removeObserver(this);
}

ToolPanelButton *ToolPanelViewController::button(const QString &identifier) const
{
    return m_buttonMapping ? m_buttonMapping->value(identifier) : nullptr;
}

platform::Window &ToolPanelViewController::panelWindow() const
{
    const platform::View *const root = require(view(), "the tool panel has no view");
    return *require(qobject_cast<platform::Window *>(root->widget().window()),
        "the tool panel is in no window");
}

DrawingCanvasView &ToolPanelViewController::canvas() const
{
    auto *const drawing = dynamic_cast<DrawingCanvasDelegate *>(
        require(m_toolSelectionDelegate.get(), "the tool panel has no drawing to serve"));
    require(drawing, "what the tool panel serves is no drawing");
    return *require(drawing->drawingView(), "the tool panel's drawing has no canvas");
}

// Loading

void ToolPanelViewController::viewDidLoad()
{
    const ToolPanelOutlets &out = m_outlets;
    m_buttonMapping = ButtonMapping { { Tools::text, &outlet(out.textButton) },
        { Tools::brush, &outlet(out.brushButton) }, { Tools::eraser, &outlet(out.eraserButton) },
        { Tools::color, &outlet(out.colorButton) }, { Tools::clear, &outlet(out.clearButton) },
        { Tools::state, &outlet(out.stateButton) }, { Tools::redo, &outlet(out.redoButton) },
        { Tools::undo, &outlet(out.undoButton) } };
    m_buttons = Buttons { out.textButton, out.brushButton, out.eraserButton, out.colorButton,
        out.clearButton, out.redoButton, out.undoButton };
    ViewController::viewDidLoad();
    view()->setWantsLayer(true);
    // So that no drawing cursor of the canvas survives over the tool bar.
    view()->addCursorRect(view()->bounds(), platform::Cursor::arrow());
    makePopoverWindow(std::make_unique<PopoverViewController>(QStringLiteral("CommonPopoverView"),
        *require(penwickBundle(), "the resource bundle is not set")));
    observe();
    followInput();
}

// The window owns the popovers' controller, and keeps it when another of its popovers becomes the
// content.
void ToolPanelViewController::makePopoverWindow(std::unique_ptr<PopoverViewController> popovers)
{
    m_popoverVc = popovers.get();
    m_popoverW = std::make_unique<platform::Window>();
    m_popoverW->setObjectName(QStringLiteral("popover"));
    platform::WindowAttributes attributes;
    attributes.styleMask = platform::StyleMask::unifiedTitleAndToolbar;
    attributes.sharingType = platform::SharingType::none;
    attributes.titleVisibility = platform::TitleVisibility::hidden;
    attributes.titlebarAppearsTransparent = true;
    attributes.isOpaque = false;
    attributes.backgroundColor = Qt::transparent;
    attributes.isMovable = false;
    attributes.level = platform::WindowLevel::mainMenu;
    attributes.animationBehavior = platform::AnimationBehavior::utilityWindow;
    m_popoverW->setAttributes(attributes);
    const platform::Size size
        = require(m_popoverVc->view(), "the popovers have no view")->frame().size();
    m_popoverW->setFrame({ 0.0, 0.0, size.width, size.height });
    platform::contentOf(*m_popoverW).setContentViewController(std::move(popovers));
}

void ToolPanelViewController::observe()
{
    NotificationCenter::defaultCenter().addObserver(this, penwickNotificationKey(),
        [this](const auto &notification) { updateUndoRedoButtonState(notification); });
    platform::Workspace &workspace = platform::Workspace::shared();
    workspace.notificationCenter().addObserver(this,
        platform::Workspace::accessibilityDisplayOptionsDidChangeNotification(),
        [this](const auto &) { determineEndButtonBackgroundColor(); });
}

// Appearing

void ToolPanelViewController::viewWillAppear()
{
    require(m_popoverVc.data(), "the tool panel has no popovers")
        ->setCurrentPopoverWindow(m_popoverW.get());
    connectToDrawing();
    paintPanel();
    titleEndButton();
    determineEndButtonBackgroundColor();
    outlet(m_outlets.stateButton).layer()->cornerRadius = endButtonRadius;
    selectCurrentTool();
    outlet(m_outlets.undoButton).setEnabled(false);
    outlet(m_outlets.redoButton).setEnabled(false);
}

void ToolPanelViewController::connectToDrawing()
{
    platform::Window *const drawingWindow
        = require(panelWindow().parentWindow(), "the tool panel belongs to no drawing window");
    auto *const controller = require(
        dynamic_cast<platform::WindowController *>(platform::contentOf(*drawingWindow).responder()),
        "the drawing window has no controller");
    platform::Window *const window
        = require(controller->window(), "the drawing window's controller has no window");
    auto *const drawing = require(
        dynamic_cast<DrawViewController *>(platform::contentOf(*window).contentViewController()),
        "the drawing window's content is no drawing");
    m_toolSelectionDelegate = drawing;
    m_popoverVc->setToolPopoverDelegate(drawing);
    m_popoverVc->setToolPanelOptionDelegate(this);
    canvas().setPopoverWindow(m_popoverW.get());
    canvas().setToolChooser(this);
}

void ToolPanelViewController::paintPanel()
{
    platform::PlainView &panel = outlet(m_outlets.toolPanelView);
    platform::PlainView &handle = outlet(m_outlets.toolBarHandle);
    setViewBorder(panel, ToolPanelUI::toolPanelBorderColor, panelBorderWidth,
        ToolPanelUI::toolPanelBorderRadius);
    handle.setWantsLayer(true);
    handle.layer()->backgroundColor = TnhColors::toolPanelHandleColor;
    panel.setWantsLayer(true);
    panel.layer()->backgroundColor = ToolPanelUI::toolPanelColor;
}

void ToolPanelViewController::titleEndButton()
{
    outlet(m_outlets.stateButton)
        .setAttributedTitle(
            { tr("END"), Qt::white, platform::ownFont(endFontSize), Qt::AlignHCenter });
}

void ToolPanelViewController::determineEndButtonBackgroundColor()
{
    const bool isIncreased
        = platform::Workspace::shared().accessibilityDisplayShouldIncreaseContrast();
    outlet(m_outlets.stateButton)
        .setBackgroundColor(
            isIncreased ? TnhColors::endButtonColorContrast : TnhColors::endButtonColor);
    for (const auto &each : m_buttons.value_or(Buttons {}))
        outlet(each).toggleToolState();
}

void ToolPanelViewController::showSelected(ToolPanelButton *button, bool isSelected)
{
    if (!button)
        return;
    button->setIsSelected(isSelected);
    button->toggleToolState();
}

void ToolPanelViewController::selectCurrentTool()
{
    m_selectedButtonId = canvas().currentSelectedTool();
    m_lastSelectedButton = button(m_selectedButtonId);
    m_currentSelectedButton = m_lastSelectedButton;
    showSelected(m_lastSelectedButton, false);
    showSelected(m_currentSelectedButton, true);
}

// Pressing

void ToolPanelViewController::OnToolBarItemSelection(platform::Button &sender)
{
    m_selectedButtonId = sender.identifier();
    if (m_selectedButtonId.isEmpty())
        platform::fatalError("a button of the tool panel has no identifier");
    const QString toolBefore = canvas().currentSelectedTool();
    m_currentSelectedButton = button(m_selectedButtonId);
    m_lastSelectedButton = button(toolBefore);
    showSelected(m_lastSelectedButton, false);
    showSelected(m_currentSelectedButton, true);
    showPopoverFor(m_selectedButtonId, toolBefore);
    // Last: "state" ends the session, and with it this panel.
    if (ToolSelectionDelegate *const drawing = m_toolSelectionDelegate.get())
        drawing->handleToolSelection(m_selectedButtonId);
}

void ToolPanelViewController::chooseTool(const QString &tool)
{
    if (ToolPanelButton *const pressed = button(tool))
        OnToolBarItemSelection(*pressed);
}

void ToolPanelViewController::showPopoverFor(const QString &identifier, const QString &toolBefore)
{
    if (identifier == Tools::text || identifier == Tools::brush) {
        if (toolBefore == identifier)
            togglePopover(identifier == Tools::text ? PopoverChoice::textpopover
                                                    : PopoverChoice::brushpopover);
        else
            hidePopover();
    } else if (identifier == Tools::color) {
        if (m_popoverW->isVisible()) {
            hidePopover(); // the colour button then stays selected
        } else {
            showPopoverIfRequired(PopoverChoice::colorpopover);
            restoreSelection();
        }
    } else if (identifier == Tools::clear || identifier == Tools::undo
        || identifier == Tools::redo) {
        hidePopover();
        restoreSelection();
    } else if (identifier == Tools::eraser || identifier == Tools::state) {
        hidePopover();
    } else {
        platform::printLine("Default");
    }
}

void ToolPanelViewController::restoreSelection()
{
    showSelected(m_currentSelectedButton, false);
    showSelected(m_lastSelectedButton, true);
}

void ToolPanelViewController::togglePopover(PopoverChoice choice)
{
    if (m_popoverW->isVisible())
        hidePopover();
    else
        showPopoverIfRequired(choice);
}

void ToolPanelViewController::hidePopover()
{
    if (m_popoverW->isVisible())
        m_popoverW->orderOut();
}

void ToolPanelViewController::showPopoverIfRequired(PopoverChoice choice)
{
    PopoverView *popover = nullptr;
    const ToolPanelButton *anchor = nullptr;
    switch (choice) {
    case PopoverChoice::textpopover:
        popover = m_popoverVc->textPopoverView();
        anchor = m_outlets.textButton;
        break;
    case PopoverChoice::colorpopover:
        popover = m_popoverVc->colorPopoverView();
        anchor = m_outlets.colorButton;
        break;
    case PopoverChoice::brushpopover:
        popover = m_popoverVc->brushPopoverView();
        anchor = m_outlets.brushButton;
        break;
    }
    require(popover, "a popover view is missing");
    placePopover(*require(anchor, "an outlet of the tool panel is not connected"));
    if (choice == m_visiblePopover) {
        m_popoverW->orderFront();
        return;
    }
    m_visiblePopover = choice;
    platform::contentOf(*m_popoverW).setContentView(popover);
    panelWindow().addChildWindow(*m_popoverW);
}

void ToolPanelViewController::placePopover(const ToolPanelButton &anchor)
{
    const platform::Rect panel = panelWindow().frame();
    const platform::Size size = m_popoverW->frame().size();
    const platform::Rect place { panel.x + popoverGap + view()->frame().maxX() + anchor.frame().x,
        panel.y + anchor.frame().y, size.width, size.height };
    // A popover that reaches beyond the screen is moved onto it, because nobody could reach its
    // options there. It is not moved over the panel, where it would cover the button that closes
    // it.
    m_popoverW->setFrame(platform::broughtInsideBeside(place, platform::workAreaFor(panel), panel));
}

// What others tell

void ToolPanelViewController::updateUndoRedoButtonState(const platform::Notification &notification)
{
    if (notification.object.typeId() != QMetaType::QVariantMap)
        return;
    const QVariantMap states = notification.object.toMap();
    for (const QVariant &value : states) {
        if (value.typeId() != QMetaType::Bool)
            return;
    }
    const auto redoState = states.constFind(QStringLiteral("enableRedo"));
    if (redoState != states.constEnd())
        outlet(m_outlets.redoButton).setEnabled(redoState->toBool());
    const auto undoState = states.constFind(QStringLiteral("enableUndo"));
    if (undoState != states.constEnd())
        outlet(m_outlets.undoButton).setEnabled(undoState->toBool());
}

void ToolPanelViewController::changeColorToolImage(const QString &newColorState)
{
    const auto &bundle = require(penwickBundle(), "the resource bundle is not set");
    outlet(m_outlets.colorButton).setImage(bundle->imageForResource(newColorState));
}

} // namespace penwick
