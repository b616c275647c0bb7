// SPDX-License-Identifier: MIT
// The controller of the tool bar's content.
#pragma once

#include "canvas/ToolChooser.h"
#include "canvas/ToolSelectionDelegate.h"
#include "platform/foundation/WeakReference.h"
#include "platform/view/ViewController.h"
#include "toolpanel/PopoverChoice.h"
#include "toolpanel/ToolKeyRest.h"
#include "toolpanel/ToolPanelOptionDelegate.h"

#include <penwick/platform/NotificationCenter.h>

#include <QHash>
#include <QPointer>

#include <memory>
#include <optional>
#include <vector>

class QKeyEvent;

namespace penwick {

class DrawingCanvasView;
class PopoverViewController;
class ToolPanelButton;

namespace platform {
class Button;
class PlainView;
class View;
class Window;
} // namespace platform

/// What the tool bar's scene connects. Weak; one that is missing where it is used stops the
/// process.
struct ToolPanelOutlets
{
    QPointer<platform::PlainView> toolBarHandle;
    QPointer<platform::PlainView> toolPanelView;
    QPointer<ToolPanelButton> textButton;
    QPointer<ToolPanelButton> brushButton;
    QPointer<ToolPanelButton> eraserButton;
    QPointer<ToolPanelButton> colorButton;
    QPointer<ToolPanelButton> clearButton;
    QPointer<ToolPanelButton> stateButton;
    QPointer<ToolPanelButton> redoButton;
    QPointer<ToolPanelButton> undoButton;
};

/// Keeps the button of the canvas's tool selected, hands every press on to the drawing side, shows
/// the popovers in a window of their own and enables undo and redo as the history says.
///
/// Its stored values have setters for whoever puts a tool bar together from parts. It owns none of
/// them but the popovers' window.
class ToolPanelViewController final : public platform::ViewController,
                                      public ToolPanelOptionDelegate,
                                      public ToolChooser
{
    Q_OBJECT

public:
    ToolPanelViewController();
    ~ToolPanelViewController() override;

    [[nodiscard]] ToolPanelOutlets &outlets() { return m_outlets; }
    /// Receives the choice of a tool. It is null until the panel appears, and then the controller
    /// of the drawing window's content. It must be a DrawingCanvasDelegate too, or the first press
    /// stops the process. Weak.
    [[nodiscard]] ToolSelectionDelegate *toolSelectionDelegate() const;
    void setToolSelectionDelegate(ToolSelectionDelegate *delegate);
    /// The popovers' controller; null until the view was loaded. The popovers' window owns it.
    [[nodiscard]] PopoverViewController *popoverVc() const;
    /// The window that shows the popovers; null until the view was loaded.
    [[nodiscard]] platform::Window *popoverW() const { return m_popoverW.get(); }
    /// The popover that was put into the window last; nothing before the first. Hiding it does not
    /// change this.
    [[nodiscard]] std::optional<PopoverChoice> visiblePopover() const { return m_visiblePopover; }
    void setVisiblePopover(std::optional<PopoverChoice> choice) { m_visiblePopover = choice; }
    /// The button pressed last.
    [[nodiscard]] const QString &selectedButtonId() const { return m_selectedButtonId; }
    void setSelectedButtonId(const QString &identifier) { m_selectedButtonId = identifier; }
    /// The button called `identifier`; null for an unknown one.
    [[nodiscard]] ToolPanelButton *button(const QString &identifier) const;

    using ButtonMapping = QHash<QString, QPointer<ToolPanelButton>>;
    using Buttons = std::vector<QPointer<ToolPanelButton>>;
    /// All eight buttons by their identifiers; nothing until the view was loaded.
    [[nodiscard]] const std::optional<ButtonMapping> &buttonMapping() const;
    void setButtonMapping(const std::optional<ButtonMapping> &mapping);
    /// The seven that are painted anew when the contrast changes, all but the end button, in their
    /// order; nothing until the view was loaded.
    [[nodiscard]] const std::optional<Buttons> &buttons() const;
    void setButtons(const std::optional<Buttons> &buttons);
    /// Kept, but not used.
    [[nodiscard]] ToolPanelButton *lastSelectedTool() const;
    void setLastSelectedTool(ToolPanelButton *button);
    /// The button of the tool that was the canvas's before the press.
    [[nodiscard]] ToolPanelButton *lastSelectedButton() const;
    void setLastSelectedButton(ToolPanelButton *button);
    /// The button that was just pressed.
    [[nodiscard]] ToolPanelButton *currentSelectedButton() const;
    void setCurrentSelectedButton(ToolPanelButton *button);

    void viewDidLoad() override;
    /// Finds the drawing side through the windows and takes its state over. A missing link stops
    /// the process.
    void viewWillAppear() override;

    /// The action of all eight buttons; a sender without identifier stops the process.
    void OnToolBarItemSelection(platform::Button &sender); // NOLINT: the name is fixed
    void chooseTool(const QString &tool) override;
    /// Enables undo and redo as the notification's object says; any other object is ignored.
    void updateUndoRedoButtonState(const platform::Notification &notification);
    void changeColorToolImage(const QString &newColorState) override;
    /// Takes the popover off the screen.
    void hidePopover();
    /// Presses the button, or the option of the open popover, that the key stands for; Escape
    /// closes the popover. Returns whether the key stood for any of these.
    ///
    /// While a text is edited all keys are its editor's. A key that is held down works only once.
    /// Letters and digits rest as ToolKeyRest says.
    bool performKey(const QKeyEvent &event);
    /// The keyboard has come to the tool bar: letters and digits work it again.
    void keyboardEntered() { m_keyRest.keyboardEnteredBar(); }

private:
    void makePopoverWindow(std::unique_ptr<PopoverViewController> popovers);
    void observe();
    void followInput();
    void onPressed(const platform::View &view);
    void onKeyPressed(const platform::View &view);
    void connectToDrawing();
    void paintPanel();
    void titleEndButton();
    void selectCurrentTool();
    void determineEndButtonBackgroundColor();
    void showPopoverIfRequired(PopoverChoice choice);
    void placePopover(const ToolPanelButton &anchor);
    void togglePopover(PopoverChoice choice);
    void showPopoverFor(const QString &identifier, const QString &toolBefore);
    void restoreSelection();
    bool performPopoverKey(const QKeyEvent &event);
    [[nodiscard]] bool isInOwnWindow(const platform::View &pressed) const;
    [[nodiscard]] platform::Window &panelWindow() const;
    [[nodiscard]] DrawingCanvasView *canvasIfAny() const;
    [[nodiscard]] DrawingCanvasView &canvas() const;
    static void showSelected(ToolPanelButton *button, bool isSelected);

    ToolPanelOutlets m_outlets;
    platform::WeakReference<ToolSelectionDelegate> m_toolSelectionDelegate;
    QPointer<ToolPanelButton> m_lastSelectedTool;
    std::optional<ButtonMapping> m_buttonMapping;
    std::optional<Buttons> m_buttons;
    QPointer<PopoverViewController> m_popoverVc; // in m_popoverW
    std::unique_ptr<platform::Window> m_popoverW;
    QString m_selectedButtonId;
    QPointer<ToolPanelButton> m_lastSelectedButton;
    QPointer<ToolPanelButton> m_currentSelectedButton;
    std::optional<PopoverChoice> m_visiblePopover;
    ToolKeyRest m_keyRest;
};

} // namespace penwick
