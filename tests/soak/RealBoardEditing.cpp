// SPDX-License-Identifier: MIT
// What reaches a box's editor otherwise than by pointer and keys: menu, input method, drop.
#include "soak/RealBoard.h"

#include "canvas/DrawingCanvasView.h"
#include "textbox/TnTextBox.h"

#include <penwick/platform/Window.h>

#include <QApplication>
#include <QClipboard>
#include <QDragEnterEvent>
#include <QImage>
#include <QInputMethodEvent>
#include <QMenu>
#include <QMimeData>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QWindow>

namespace penwick::test {

namespace {

QMenu *openMenu()
{
    return qobject_cast<QMenu *>(QApplication::activePopupWidget());
}

bool canBeChosen(const QAction &item)
{
    return item.isEnabled() && item.isVisible() && !item.isSeparator() && !item.menu();
}

void fill(QMimeData &data, const std::string &text)
{
    if (text.empty())
        data.setImageData(QImage(4, 4, QImage::Format_RGB32));
    else
        data.setText(QString::fromStdString(text));
}

void sendToEditor(const QWindow &window, QInputMethodEvent &event)
{
    if (QObject *const editor = window.focusObject())
        QCoreApplication::sendEvent(editor, &event);
}

} // namespace

const TnTextBox *RealBoard::boxCalled(const std::string &name) const
{
    for (platform::View *const view : canvas().subviews()) {
        if (nameOf(view) == name)
            return dynamic_cast<const TnTextBox *>(view);
    }
    return nullptr;
}

bool RealBoard::isOnCanvas(const std::string &box) const
{
    return boxCalled(box);
}

Spot RealBoard::cornerOf(const std::string &box) const
{
    const platform::Rect frame = boxCalled(box)->frame();
    return { frame.x, frame.maxY() };
}

Spot RealBoard::sizeOf(const std::string &box) const
{
    const platform::Size size = boxCalled(box)->frame().size();
    return { size.width, size.height };
}

std::string RealBoard::textOf(const std::string &box) const
{
    const TnTextBox *const found = boxCalled(box);
    return found ? found->toPlainText().toStdString() : std::string();
}

// Wherever in the text it is: not only where the caret stands.
std::string RealBoard::composedIn(const std::string &box) const
{
    const TnTextBox *const found = boxCalled(box);
    QString all;
    for (QTextBlock block = found ? found->document()->begin() : QTextBlock(); block.isValid();
         block = block.next())
        all += block.layout()->preeditAreaText();
    return all.toStdString();
}

// The input method

void RealBoard::compose(const std::string &half)
{
    QInputMethodEvent event(QString::fromStdString(half), {});
    sendToEditor(*window().windowHandle(), event);
}

void RealBoard::commit(const std::string &whole)
{
    QInputMethodEvent event;
    event.setCommitString(QString::fromStdString(whole));
    sendToEditor(*window().windowHandle(), event);
}

// From another application

bool RealBoard::dragOver(Spot spot, const std::string &text)
{
    QMimeData data;
    fill(data, text);
    const QPoint place = inWindow(spot).toPoint();
    QWindow &target = *window().windowHandle();
    if (!std::exchange(m_isDraggedOver, true)) {
        QDragEnterEvent enter(place, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(&target, &enter);
    }
    QDragMoveEvent move(place, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&target, &move);
    return move.isAccepted();
}

void RealBoard::drop(Spot spot, const std::string &text)
{
    if (!dragOver(spot, text))
        return dragAway(); // a desktop drops nothing where nobody would have it
    QMimeData data;
    fill(data, text);
    QDropEvent event(inWindow(spot), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(window().windowHandle(), &event);
    m_isDraggedOver = false;
}

void RealBoard::dragAway()
{
    QDragLeaveEvent leave;
    QCoreApplication::sendEvent(window().windowHandle(), &leave);
    m_isDraggedOver = false;
}

void RealBoard::copyElsewhere(const std::string &text)
{
    QGuiApplication::clipboard()->setText(QString::fromStdString(text));
}

std::string RealBoard::clipboard()
{
    return QGuiApplication::clipboard()->text().toStdString();
}

// The menu

void RealBoard::openMenuByKey()
{
    QContextMenuEvent event(QContextMenuEvent::Keyboard, {}, {}, Qt::NoModifier);
    QCoreApplication::sendEvent(window().windowHandle(), &event);
}

std::string RealBoard::menu() const
{
    const QMenu *const menu = openMenu();
    for (QWidget *widget = menu ? menu->parentWidget() : nullptr; widget;
         widget = widget->parentWidget()) {
        if (auto *const view = dynamic_cast<platform::View *>(widget))
            return nameOf(view);
    }
    return menu ? "?" : "";
}

std::vector<std::string> RealBoard::menuItems()
{
    std::vector<std::string> names;
    for (const QAction *const item : openMenu()->actions()) {
        if (canBeChosen(*item))
            names.push_back(item->objectName().toStdString());
    }
    return names;
}

void RealBoard::chooseFromMenu(const std::string &item, bool byPointer)
{
    QMenu &menu = *openMenu();
    for (QAction *const each : menu.actions()) {
        if (each->objectName().toStdString() != item)
            continue;
        if (byPointer) {
            const QPointF place(menu.actionGeometry(each).center());
            sendTo(menu, place, Qt::LeftButton, QEvent::MouseButtonPress);
            sendTo(menu, place, Qt::LeftButton, QEvent::MouseButtonRelease);
        } else {
            menu.setActiveAction(each);
            key("Return");
        }
        return;
    }
}

bool RealBoard::isBoardAt(Spot spot) const
{
    const QWidget *const widget
        = QApplication::widgetAt(window().mapToGlobal(inWindow(spot).toPoint()));
    return widget && widget->window() == &window();
}

} // namespace penwick::test
