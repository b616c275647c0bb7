// SPDX-License-Identifier: MIT
#include "sessions/RealBoard.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/UndoRedoManager.h"
#include "session/ToolPanelWindowController.h"
#include "textbox/DeleteTextBoxButton.h"
#include "textbox/TnTextBox.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolOptionsButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <penwick/platform/NotificationCenter.h>

#include <QApplication>
#include <QImage>
#include <QScreen>
#include <QTest>
#include <QWindow>

#include <stdexcept>

namespace penwick::sessions {

namespace {

constexpr int longAfter = 1000; // ms, no double click
constexpr int soonAfter = 100;

/// While it lives, a window does not hear that it is, or is not any more, the active one.
class Deaf final : public QObject
{
public:
    explicit Deaf(QWidget &window) { window.installEventFilter(this); }
    bool eventFilter(QObject *, QEvent *event) override
    {
        return event->type() == QEvent::ActivationChange;
    }
};

QString text(const std::string &name)
{
    return QString::fromStdString(name);
}

} // namespace

RealBoard::RealBoard()
{
    platform::NotificationCenter::defaultCenter().addObserver(
        this, QString(), [this](const auto &) { learnNames(); });
}

RealBoard::~RealBoard()
{
    platform::NotificationCenter::defaultCenter().removeObserver(this);
    m_controller.reset();
    m_penwick.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void RealBoard::open(WindowType type)
{
    m_held = {};
    m_controller.reset();
    if (!m_penwick)
        m_penwick = std::make_unique<Penwick>();
    QImage image(480, 270, QImage::Format_RGB32);
    image.fill(Qt::lightGray);
    m_controller
        = m_penwick->createDrawingWindowController(type, QGuiApplication::primaryScreen(), image);
    m_controller->showWindow(nullptr);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents(); // windows come to the screen
    QApplication::setActiveWindow(&window());
    paint();
    m_names.clear();
    m_deleteButtons.clear();
    m_strokes = 0;
    m_boxes = 0;
    m_recorder = std::make_unique<test::NotificationRecorder>();
}

DrawViewController &RealBoard::controller() const
{
    return dynamic_cast<DrawViewController &>(*window().contentViewController());
}

DrawingCanvasView &RealBoard::canvas() const
{
    return *controller().drawingView();
}

ToolPanelViewController &RealBoard::bar() const
{
    return m_controller->tPanelWindowController()->content();
}

platform::Window &RealBoard::window() const
{
    return *m_controller->drawingWindow();
}

platform::Button &RealBoard::option(const std::string &name) const
{
    PopoverViewController &popovers = *bar().popoverVc();
    for (PopoverView *const popover :
        { popovers.textPopoverView(), popovers.colorPopoverView(), popovers.brushPopoverView() }) {
        for (platform::View *const view : popover->subviews().at(0)->subviews()) {
            auto &button = dynamic_cast<platform::Button &>(*view);
            if (button.identifier() == text(name))
                return button;
        }
    }
    throw std::runtime_error("no option " + name);
}

// The pointer

QPointF RealBoard::inWindow(Spot spot) const
{
    return { spot.x, window().height() - spot.y };
}

Spot RealBoard::size() const
{
    return { canvas().bounds().width, canvas().bounds().height };
}

std::string RealBoard::targetAt(Spot spot) const
{
    for (QWidget *widget = window().childAt(inWindow(spot).toPoint()); widget;
         widget = widget->parentWidget()) {
        if (auto *const view = dynamic_cast<platform::View *>(widget))
            return nameOf(view);
    }
    return "canvas";
}

Spot RealBoard::middleOf(const std::string &name) const
{
    for (platform::View *const view : canvas().subviews()) {
        const QRect seen = canvas().rect().intersected(view->widget().geometry());
        if (nameOf(view) == name && !view->isHidden() && !seen.isEmpty()) {
            return { static_cast<double>(seen.center().x()),
                static_cast<double>(window().height() - seen.center().y()) };
        }
    }
    return { size().x / 2, size().y / 2 };
}

void RealBoard::send(QWindow &target, QPointF place, Qt::MouseButton button, QEvent::Type type)
{
    m_held.setFlag(button, type == QEvent::MouseButtonPress);
    qt_handleMouseEvent(
        &target, place, place + target.position(), m_held, button, type, Qt::NoModifier, m_time);
}

void RealBoard::sendTo(QWidget &widget, QPointF place, Qt::MouseButton button, QEvent::Type type)
{
    QWidget &top = *widget.window();
    send(*top.windowHandle(), widget.mapTo(&top, place), button, type);
}

void RealBoard::press(Spot spot, Qt::MouseButton button)
{
    m_time += longAfter;
    send(*window().windowHandle(), inWindow(spot), button, QEvent::MouseButtonPress);
}

void RealBoard::pressAgain(Spot spot)
{
    m_time += soonAfter;
    send(*window().windowHandle(), inWindow(spot), Qt::LeftButton, QEvent::MouseButtonPress);
}

void RealBoard::move(Spot spot)
{
    send(*window().windowHandle(), inWindow(spot), Qt::NoButton, QEvent::MouseMove);
}

void RealBoard::release(Spot spot, Qt::MouseButton button)
{
    send(*window().windowHandle(), inWindow(spot), button, QEvent::MouseButtonRelease);
}

void RealBoard::closeMenu()
{
    while (QWidget *const menu = QApplication::activePopupWidget())
        menu->close();
}

// The tool bar

void RealBoard::clickTool(const std::string &name, bool byPointer)
{
    click(*bar().button(text(name)), byPointer);
}

void RealBoard::click(QAbstractButton &button, bool byPointer)
{
    if (byPointer) {
        m_time += longAfter;
        const QPointF place(button.rect().center());
        sendTo(button, place, Qt::LeftButton, QEvent::MouseButtonPress);
        sendTo(button, place, Qt::LeftButton, QEvent::MouseButtonRelease);
    } else {
        button.click();
    }
}

void RealBoard::pressToolElsewhere(const std::string &name)
{
    QWidget &button = *bar().button(text(name));
    m_time += longAfter;
    const QPointF beside(-2, 5);
    sendTo(button, { 5, 5 }, Qt::LeftButton, QEvent::MouseButtonPress);
    sendTo(button, beside, Qt::NoButton, QEvent::MouseMove);
    sendTo(button, beside, Qt::LeftButton, QEvent::MouseButtonRelease);
}

void RealBoard::chooseOption(const std::string &name, bool byPointer)
{
    click(option(name), byPointer);
}

void RealBoard::pressPanel()
{
    QWindow &panel = *m_controller->tPanelWindowController()->window()->windowHandle();
    m_time += longAfter;
    send(panel, { 2, 12 }, Qt::LeftButton, QEvent::MouseButtonPress);
    send(panel, { 2, 12 }, Qt::LeftButton, QEvent::MouseButtonRelease);
    m_controller->tPanelWindowController()->adjustPosition(); // what the timer does later
}

// Keys

void RealBoard::key(const std::string &name)
{
    static const std::map<std::string, Qt::Key> named { { "Return", Qt::Key_Return },
        { "Tab", Qt::Key_Tab }, { "Escape", Qt::Key_Escape }, { "BackSpace", Qt::Key_Backspace },
        { "C-Delete", Qt::Key_Delete }, { "C-End", Qt::Key_End } };
    const bool withControl = name.starts_with("C-");
    const auto found = named.find(name);
    const char letter = name.back();
    const auto key = found != named.end()
        ? found->second
        : static_cast<Qt::Key>(QChar::fromLatin1(letter).toUpper().unicode());
    const Qt::KeyboardModifiers modifiers = withControl ? Qt::ControlModifier : Qt::NoModifier;
    const QString typed = withControl || found != named.end() ? QString() : text(name);
    QWindow &target = *window().windowHandle();
    qt_handleKeyEvent(&target, QEvent::KeyPress, key, modifiers, typed);
    qt_handleKeyEvent(&target, QEvent::KeyRelease, key, modifiers, typed);
}

// The window

void RealBoard::paint()
{
    // Twice: what came to the canvas while it was painted is painted next.
    for (int pass = 0; pass < 2; ++pass) {
        QEvent update(QEvent::UpdateRequest);
        QCoreApplication::sendEvent(&window(), &update);
    }
}

void RealBoard::activate(bool isActive)
{
    QApplication::setActiveWindow(isActive ? &window() : nullptr);
}

void RealBoard::minimise(bool isMinimised)
{
    window().setWindowState(isMinimised ? Qt::WindowMinimized : Qt::WindowNoState);
    m_held = {};
}

void RealBoard::hide()
{
    window().hide();
    m_held = {}; // what is let go over a window that is gone is not heard of
}

void RealBoard::show()
{
    {
        const Deaf deaf(window()); // without a screen every window that is shown becomes active
        m_controller->showWindow(nullptr);
        QCoreApplication::processEvents();
    }
    QApplication::setActiveWindow(nullptr);
    QApplication::setActiveWindow(&window());
    turn();
}

void RealBoard::close()
{
    window().windowHandle()->close(); // as the title bar's button does
}

void RealBoard::showBanner(bool isShown)
{
    if (isShown)
        m_penwick->showWindowSharingNotification();
    else
        m_controller->closeSharingNotificationWindow(); // what the timer does later
}

void RealBoard::turn()
{
    QCoreApplication::sendPostedEvents();
    paint();
}

} // namespace penwick::sessions
