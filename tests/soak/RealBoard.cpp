// SPDX-License-Identifier: MIT
#include "soak/RealBoard.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/UndoRedoManager.h"
#include "platform/window/WindowContent.h"
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
#include <QVariantAnimation>
#include <QWindow>

#include <cmath>
#include <stdexcept>

namespace penwick::test {

namespace {

constexpr int longAfter = 1000; // ms, no double click
constexpr int soonAfter = 100;

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
    m_isDraggedOver = false;
    m_controller.reset();
    if (!m_penwick)
        m_penwick = std::make_unique<Penwick>();
    QImage image(480, 270, QImage::Format_RGB32);
    image.fill(Qt::lightGray);
    m_controller
        = m_penwick->createDrawingWindowController(type, QGuiApplication::primaryScreen(), image);
    m_controller->showWindow(nullptr);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    hearDesktop(); // windows come to the screen
    activate(true);
    paint();
    m_names.clear();
    m_deleteButtons.clear();
    m_strokes = 0;
    m_boxes = 0;
    copyElsewhere("");
    m_recorder = std::make_unique<NotificationRecorder>();
}

DrawViewController &RealBoard::controller() const
{
    return dynamic_cast<DrawViewController &>(*contentOf(window()).contentViewController());
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

QPointF RealBoard::onDesktop(Spot spot) const
{
    return inWindow(spot) + window().windowHandle()->position();
}

Spot RealBoard::size() const
{
    return { canvas().bounds().width, canvas().bounds().height };
}

std::size_t RealBoard::shownStrokes() const
{
    return static_cast<std::size_t>(canvas().pathArray().size());
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
    return { std::floor(size().x / 2), std::floor(size().y / 2) };
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
    const bool closesMenu = QApplication::activePopupWidget();
    QWindow &target = *window().windowHandle();
    const QPointF place = inWindow(spot);
    send(target, place, button, QEvent::MouseButtonPress);
    if (!closesMenu)
        return;
    // A press beside a menu closes it, and a desktop that can grab the pointer gives it once more.
    QMouseEvent again(
        QEvent::MouseButtonPress, place, onDesktop(spot), button, m_held, Qt::NoModifier);
    QCoreApplication::sendEvent(&target, &again);
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
    const platform::Window &window = *m_controller->tPanelWindowController()->window();
    // A press would stop a panel that glides where it is seen, which depends on the machine's
    // speed.
    for (auto *const way : window.findChildren<QVariantAnimation *>())
        way->setCurrentTime(way->duration());
    QWindow &panel = *window.windowHandle();
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
        { "Delete", Qt::Key_Delete }, { "Home", Qt::Key_Home }, { "End", Qt::Key_End },
        { "Left", Qt::Key_Left }, { "Right", Qt::Key_Right }, { "Down", Qt::Key_Down } };
    Qt::KeyboardModifiers modifiers;
    std::string last = name;
    for (; last.size() > 2 && last[1] == '-'; last.erase(0, 2))
        modifiers |= last[0] == 'C' ? Qt::ControlModifier : Qt::ShiftModifier;
    const auto found = named.find(last);
    const bool isLetter = found == named.end();
    const auto key = isLetter
        ? static_cast<Qt::Key>(QChar::fromLatin1(last.front()).toUpper().unicode())
        : found->second;
    const QString typed
        = isLetter && !modifiers.testFlag(Qt::ControlModifier) ? text(last) : QString();
    QWindow &target = *window().windowHandle();
    qt_handleKeyEvent(&target, QEvent::KeyPress, key, modifiers, typed);
    qt_handleKeyEvent(&target, QEvent::KeyRelease, key, modifiers, typed);
}

} // namespace penwick::test
