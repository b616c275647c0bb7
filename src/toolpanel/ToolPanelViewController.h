// SPDX-License-Identifier: MIT
// The controller of the tool bar's content.
#pragma once

#include "canvas/ToolChooser.h"
#include "platform/ViewController.h"
#include "toolpanel/PopoverChoice.h"
#include "toolpanel/ToolPanelOptionDelegate.h"

#include <penwick/platform/NotificationCenter.h>

#include <QHash>
#include <QPointer>

#include <memory>
#include <optional>
#include <vector>

class QKeyEvent;

namespace penwick {

class DrawViewController;
class DrawingCanvasView;
class PopoverViewController;
class ToolPanelButton;

namespace platform {
class Button;
class PlainView;
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
class ToolPanelViewController final : public platform::ViewController,
                                      public ToolPanelOptionDelegate,
                                      public ToolChooser
{
    Q_OBJECT

public:
    ToolPanelViewController();
    ~ToolPanelViewController() override;

    [[nodiscard]] ToolPanelOutlets &outlets() { return m_outlets; }
    /// Who gets the choice of a tool: the controller of the window that the panel belongs to; null
    /// before the panel appeared. Weak.
    [[nodiscard]] DrawViewController *toolSelectionDelegate() const;
    [[nodiscard]] PopoverViewController *popoverVc() const { return m_popoverVc.get(); }
    /// The window that shows the popovers; null until the view was loaded.
    [[nodiscard]] platform::Window *popoverW() const { return m_popoverW.get(); }
    /// The popover that was put into the window last; nothing before the first. Hiding it does not
    /// change this.
    [[nodiscard]] std::optional<PopoverChoice> visiblePopover() const { return m_visiblePopover; }
    [[nodiscard]] const QString &selectedButtonId() const { return m_selectedButtonId; }
    /// The button called `identifier`; null for an unknown one.
    [[nodiscard]] ToolPanelButton *button(const QString &identifier) const;

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
    /// closes the popover. Answers whether there was something to do.
    bool performKey(const QKeyEvent &event);

private:
    void makePopoverWindow();
    void observe();
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
    [[nodiscard]] platform::Window &panelWindow() const;
    [[nodiscard]] DrawingCanvasView &canvas() const;
    static void showSelected(ToolPanelButton *button, bool isSelected);

    ToolPanelOutlets m_outlets;
    QPointer<DrawViewController> m_toolSelectionDelegate;
    QHash<QString, QPointer<ToolPanelButton>> m_buttonMapping;
    std::vector<QPointer<ToolPanelButton>> m_buttons; // repainted on a contrast change
    std::unique_ptr<PopoverViewController> m_popoverVc;
    std::unique_ptr<platform::Window> m_popoverW;
    QString m_selectedButtonId;
    QPointer<ToolPanelButton> m_lastSelectedButton; // of the tool before the press
    QPointer<ToolPanelButton> m_currentSelectedButton; // just pressed
    std::optional<PopoverChoice> m_visiblePopover;
};

} // namespace penwick
