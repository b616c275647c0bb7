// SPDX-License-Identifier: MIT
#include <penwick/DrawingWindowController.h>

#include "appearance/PenwickBundle.h"
#include "appearance/Theme.h"
#include "appearance/ViewBorder.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/GuiThread.h"
#include "platform/view/View.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WindowFlags.h"
#include "session/PictureFit.h"
#include "session/ToolPanelWindowController.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QScreen>

#include <utility>

namespace penwick {

namespace {

using platform::Animate;
using platform::Rect;
using platform::require;

constexpr double boardBorder = 3.0; // points

Rect mainScreenFrame()
{
    return platform::frameOfScreen(
        *require(QGuiApplication::primaryScreen(), "there is no main screen"));
}

// A 16:9 box of `width`, one sixth of the screen away from the screen's bottom left corner.
Rect boardOn(const Rect &screen, double width)
{
    return { screen.x + screen.width / 6, screen.y + screen.height / 6, width, width * 9 * 0.0625 };
}

template <class Controller>
std::unique_ptr<Controller> ofMainStoryboard(const QString &identifier)
{
    return require(penwickBundle(), "the resource bundle is not set")
        ->instantiate<Controller>(QStringLiteral("Main"), identifier);
}

} // namespace

DrawingWindowController::DrawingWindowController()
    : m_minWindowWidth(mainScreenFrame().width * 2 / 3)
    , m_minWindowHeight(mainScreenFrame().height * 2 / 3)
{ }

DrawingWindowController::DrawingWindowController(std::unique_ptr<platform::Window> window)
    : WindowController(std::move(window))
    , m_minWindowWidth(mainScreenFrame().width * 2 / 3)
    , m_minWindowHeight(mainScreenFrame().height * 2 / 3)
{ }

DrawingWindowController::~DrawingWindowController()
{
    // The window is destroyed after this object, so it must not tell this object of that. Nor is
    // the host to hear, by the window's signals, how the windows above it go.
    if (window()) {
        window()->setDelegate(nullptr);
        window()->blockSignals(true);
    }
}

std::optional<platform::Point> DrawingWindowController::drawingWindowOrigin() const
{
    platform::requireGuiThread();
    return m_drawingWindowOrigin;
}

void DrawingWindowController::setDrawingWindowOrigin(const std::optional<platform::Point> &origin)
{
    platform::requireGuiThread();
    m_drawingWindowOrigin = origin;
}

std::optional<WindowType> DrawingWindowController::mWindowType() const
{
    platform::requireGuiThread();
    return m_windowType;
}

void DrawingWindowController::setMWindowType(std::optional<WindowType> type)
{
    platform::requireGuiThread();
    m_windowType = type;
}

platform::Window *DrawingWindowController::drawingWindow() const
{
    platform::requireGuiThread();
    return m_drawingWindow;
}

void DrawingWindowController::setDrawingWindow(platform::Window *window)
{
    platform::requireGuiThread();
    m_drawingWindow = window;
}

const std::shared_ptr<ToolPanelWindowController> &
DrawingWindowController::tPanelWindowController() const
{
    platform::requireGuiThread();
    return m_tPanelWindowController;
}

void DrawingWindowController::setTPanelWindowController(
    std::shared_ptr<ToolPanelWindowController> controller)
{
    platform::requireGuiThread();
    if (controller == m_tPanelWindowController)
        return;
    if (m_tPanelWindowController)
        letGo(m_tPanelWindowController->toolPanelWindow());
    m_tPanelWindowController = std::move(controller);
}

const std::shared_ptr<platform::Window> &DrawingWindowController::sharingNotificationWindow() const
{
    platform::requireGuiThread();
    return m_sharingNotificationWindow;
}

void DrawingWindowController::setSharingNotificationWindow(std::shared_ptr<platform::Window> window)
{
    platform::requireGuiThread();
    if (window == m_sharingNotificationWindow)
        return;
    letGo(m_sharingNotificationWindow.get());
    m_sharingNotificationWindow = std::move(window);
    if (m_drawingWindow && m_sharingNotificationWindow)
        m_drawingWindow->expectChildWindow(*m_sharingNotificationWindow);
}

// Somebody else may hold it, and need not be rid of it before another one has its place.
void DrawingWindowController::letGo(platform::Window *former)
{
    if (m_drawingWindow && former)
        m_drawingWindow->removeChildWindow(*former);
}

double DrawingWindowController::minWindowWidth() const
{
    platform::requireGuiThread();
    return m_minWindowWidth;
}

double DrawingWindowController::minWindowHeight() const
{
    platform::requireGuiThread();
    return m_minWindowHeight;
}

void DrawingWindowController::windowDidLoad()
{
    platform::requireGuiThread();
    WindowController::windowDidLoad();
    platform::Window &window = *require(m_drawingWindow.data(), "the drawing window is gone");
    platform::WindowAttributes attributes = window.attributes();
    attributes.backgroundColor = Qt::white;
    attributes.styleMask |= platform::StyleMask::resizable;
    attributes.hasShadow = true;
    attributes.aspectRatio = platform::Size { 16.0, 9.0 };
    window.setAttributes(attributes);
    // The title is the host's to word: its translators are asked, with an empty context.
    window.setWindowTitle(QCoreApplication::translate("", "Tarnhill Whiteboard"));
    window.setFrame(boardOn(mainScreenFrame(), m_minWindowWidth), Animate::Yes);
    loadBanner();
    attachToolBar();
}

void DrawingWindowController::loadBanner()
{
    const std::shared_ptr<platform::WindowController> controller
        = ofMainStoryboard<platform::WindowController>(
            QStringLiteral("SharingNotificationWindowController"));
    require(controller.get(), "the drawing window has no sharing banner");
    if (!controller->window())
        return;
    // This pointer to the window keeps the window's controller, which owns it, alive.
    m_sharingNotificationWindow = { controller, controller->window() };
    setNotificationWindowProperties(*m_sharingNotificationWindow);
    m_drawingWindow->expectChildWindow(*m_sharingNotificationWindow);
}

void DrawingWindowController::attachToolBar()
{
    m_tPanelWindowController
        = ofMainStoryboard<ToolPanelWindowController>(QStringLiteral("ToolPanelWindowController"));
    require(m_tPanelWindowController, "the drawing window has no tool bar");
    m_drawingWindow->addChildWindow(*require(
        m_tPanelWindowController->toolPanelWindow(), "the drawing window's tool bar has no panel"));
}

void DrawingWindowController::createWindowForApplication(WindowType win_type, QScreen &screen,
    const std::optional<QImage> &annotatedImage, const std::optional<QString> &windowTitle)
{
    platform::requireGuiThread();
    m_windowType = win_type;
    const Rect screenFrame = platform::frameOfScreen(screen);
    m_minWindowWidth = screenFrame.width * 2 / 3;
    m_minWindowHeight = screenFrame.height * 2 / 3;
    require(m_drawingWindow.data(), "the drawing window is gone")->setScreen(&screen);
    if (auto *const canvas
        = dynamic_cast<DrawingCanvasView *>(platform::contentOf(*m_drawingWindow).contentView()))
        canvas->setCoversWindow(win_type == WindowType::whiteboard);
    switch (win_type) {
    case WindowType::annotation:
        coverScreen(screen);
        break;
    case WindowType::whiteboard:
        placeAsBoard(boardOn(screenFrame, m_minWindowWidth));
        break;
    case WindowType::imageAnnotation: {
        showBoardBorder();
        if (!annotatedImage || annotatedImage->isNull())
            return; // nothing to draw on: the window stays as it was loaded, without a tool bar
        setAnnotationImage(*annotatedImage, windowTitle);
        const QSizeF size = annotatedImage->deviceIndependentSize();
        const platform::Point corner = boardOn(screenFrame, m_minWindowWidth).origin();
        m_drawingWindow->setFrame(
            { corner.x, corner.y, size.width(), size.height() }, Animate::Yes);
        break;
    }
    }
    m_drawingWindowOrigin = m_drawingWindow->frame().origin();
    m_isPlaced = true;
    placeToolBar();
    if (m_drawingWindow->isVisible())
        bringPictureInside();
    if (win_type == WindowType::whiteboard && m_sharingNotificationWindow) {
        centreBanner();
        platform::WindowAttributes attributes = m_sharingNotificationWindow->attributes();
        attributes.animationBehavior = platform::AnimationBehavior::alertPanel;
        m_sharingNotificationWindow->setAttributes(attributes);
    }
}

void DrawingWindowController::coverScreen(const QScreen &screen)
{
    platform::WindowAttributes attributes = m_drawingWindow->attributes();
    attributes.ignoresMouseEvents = false;
    attributes.isOpaque = false;
    attributes.backgroundColor = Qt::transparent;
    attributes.collectionBehavior = platform::everywhere;
    attributes.styleMask |= platform::StyleMask::fullSizeContentView;
    attributes.styleMask &= ~(platform::StyleMask::closable | platform::StyleMask::miniaturizable
        | platform::StyleMask::resizable);
    attributes.titleVisibility = platform::TitleVisibility::hidden;
    attributes.titlebarAppearsTransparent = true;
    attributes.hasShadow = false;
    attributes.level = platform::WindowLevel::mainMenu;
    m_drawingWindow->setAttributes(attributes);
    m_drawingWindow->setFrame(platform::frameOfScreen(screen), Animate::No);
}

void DrawingWindowController::placeAsBoard(const Rect &frame)
{
    showBoardBorder();
    m_drawingWindow->setFrame(frame, Animate::Yes);
}

void DrawingWindowController::showBoardBorder()
{
    platform::View &canvas = *require(platform::contentOf(*m_drawingWindow).contentView(),
        "the drawing window has no content view");
    setViewBorder(canvas, TnhColors::borderGreenColor, boardBorder, 0.0);
}

void DrawingWindowController::setAnnotationImage(
    const QImage &image, const std::optional<QString> &title)
{
    if (title)
        m_drawingWindow->setWindowTitle(*title);
    content().configureAnnotatingImageView(image);
    platform::ImageView &view = *content().annotatedImageView();
    view.setImageFrameStyle(platform::ImageFrameStyle::Photo);
    new PictureFit(*m_drawingWindow, view); // owned by the view
}

DrawViewController &DrawingWindowController::content() const
{
    return *require(dynamic_cast<DrawViewController *>(
                        platform::contentOf(*m_drawingWindow).contentViewController()),
        "the drawing window's content is no drawing");
}

} // namespace penwick
