// SPDX-License-Identifier: MIT
// The controller of one drawing window, as a host sees it.
#pragma once

#include <penwick/Export.h>
#include <penwick/WindowType.h>
#include <penwick/platform/Geometry.h>
#include <penwick/platform/Window.h>
#include <penwick/platform/WindowController.h>

#include <QImage>
#include <QPointer>
#include <QString>

#include <memory>
#include <optional>

class QScreen;

namespace penwick {

class DrawViewController;
class ToolPanelWindowController;

/// Builds and places the drawing window and announces the end of the session when it closes.
///
/// Penwick::createDrawingWindowController() makes it; the window lives as long as this object.
/// GUI thread only: on another thread, or without a QApplication, its operations stop the process.
class PENWICK_EXPORT DrawingWindowController final : public platform::WindowController,
                                                     public platform::WindowDelegate
{
    Q_OBJECT

public:
    /// Needs a primary screen: without one the process stops.
    DrawingWindowController();
    /// Takes `window`, which did not come from the component's own scene. It is not set up, and is
    /// not the drawing window until setDrawingWindow() is called with it. Needs a primary screen.
    explicit DrawingWindowController(std::unique_ptr<platform::Window> window);
    ~DrawingWindowController() override;

    /// Bottom left corner of the drawing window's frame as last recorded, in points, y up, from
    /// the primary screen's bottom left corner; nothing before the window was placed.
    [[nodiscard]] std::optional<platform::Point> drawingWindowOrigin() const;
    /// Records `origin`; moves nothing.
    void setDrawingWindowOrigin(const std::optional<platform::Point> &origin);
    /// The controller of the tool bar; null before the window was loaded. Owned.
    [[nodiscard]] const std::shared_ptr<ToolPanelWindowController> &tPanelWindowController() const;
    /// Holds `controller` in place of the former one, which is destroyed unless somebody else holds
    /// it; its panel is then no longer a child window. The new tool bar is placed and closed
    /// together with the drawing window; the caller makes its panel a child window.
    void setTPanelWindowController(std::shared_ptr<ToolPanelWindowController> controller);
    /// The banner's window; null where it could not be loaded. Owned.
    [[nodiscard]] const std::shared_ptr<platform::Window> &sharingNotificationWindow() const;
    /// Holds `window` in place of the former one, which is destroyed unless somebody else holds it,
    /// and is no longer a child window.
    void setSharingNotificationWindow(std::shared_ptr<platform::Window> window);
    /// The kind of window; nothing before the window was placed.
    [[nodiscard]] std::optional<WindowType> mWindowType() const;
    /// Records `type`, which the announcement of the session's end depends on; changes nothing of
    /// the window.
    void setMWindowType(std::optional<WindowType> type);
    /// The drawing window; null once it is gone. Owned by this controller.
    [[nodiscard]] platform::Window *drawingWindow() const;
    /// Borrows `window`.
    void setDrawingWindow(platform::Window *window);
    /// Two thirds of the screen's width, in points: the width of a whiteboard window.
    [[nodiscard]] double minWindowWidth() const;
    /// Two thirds of the screen's height, in points.
    [[nodiscard]] double minWindowHeight() const;

    /// Sets the window up as `win_type` and places it on `screen`. The frame of a window over an
    /// image is as large as the image; when it is shown it is brought inside the screen's work
    /// area, in its own shape, and the image scaled down once to what the content can hold. A
    /// drawing window that is gone stops the process.
    void createWindowForApplication(WindowType win_type, QScreen &screen,
        const std::optional<QImage> &annotatedImage, const std::optional<QString> &windowTitle);

    /// Moves the bottom left corner of `window` to the recorded origin plus this offset, in points,
    /// y up. If no origin is recorded yet, the process stops.
    void setWindowPositionRelativeToMainWindow(
        platform::Window &window, double xoffset, double yOffset);
    /// Makes `window` a transparent banner that a capture of the screen leaves out where the
    /// desktop can do that.
    void setNotificationWindowProperties(platform::Window &window);
    /// Shows the banner in the middle of the drawing window for 1.5 s. Where the drawing window is
    /// not on the screen, the banner comes up together with it if that is within this time.
    /// Without a banner nothing happens; a drawing window that was not placed stops the process.
    void showSharingNotificationWindow();
    /// Takes the banner off the screen.
    void closeSharingNotificationWindow();
    /// Takes the tool bar's popover off the screen.
    void hideThePopover();

    void windowDidLoad() override;
    /// Brings a window over an image inside its screen's work area, in its own shape. Shows the
    /// tool bar again, which went when the window was closed.
    void windowWillAppear() override;
    /// Hides the popover.
    void windowWillMove() override;
    /// Hides the popover.
    void windowDidResignMain() override;
    /// Records where the window is now.
    void windowDidMove() override;
    /// Moves the tool bar as far as the window's bottom left corner has moved, and then back inside
    /// the window.
    void windowDidResize() override;
    /// Closes the tool bar and posts penwickSessionEndNotificationKey().
    void windowWillClose() override;
    /// Works the tool bar: B, T, E, C choose a tool, the desktop's keys undo, redo and close.
    bool keyDown(const QKeyEvent &event) override;

private:
    [[nodiscard]] DrawViewController &content() const;
    void letGo(platform::Window *former);
    void coverScreen(const QScreen &screen);
    void showBoardBorder();
    void placeAsBoard(const platform::Rect &frame);
    void setAnnotationImage(const QImage &image, const std::optional<QString> &title);
    void loadBanner();
    void attachToolBar();
    void placeToolBar();
    void takeToolBarAlong(platform::Point way);
    void reopenToolBar();
    void bringPictureInside();
    void centreBanner();

    std::optional<platform::Point> m_drawingWindowOrigin;
    std::optional<WindowType> m_windowType;
    QPointer<platform::Window> m_drawingWindow;
    double m_minWindowWidth;
    double m_minWindowHeight;
    std::shared_ptr<ToolPanelWindowController> m_tPanelWindowController;
    std::shared_ptr<platform::Window> m_sharingNotificationWindow;
    bool m_isPlaced = false; // false for a window without its image, which has no tool bar
};

} // namespace penwick
