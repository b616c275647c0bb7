// SPDX-License-Identifier: MIT
#include "Session.h"

#include <penwick/platform/NotificationCenter.h>

#include <QAbstractButton>
#include <QApplication>
#include <QEvent>
#include <QScreen>
#include <QWindow>

#include <cstdio>
#include <utility>

namespace penwick::host {

using platform::NotificationCenter;

namespace {

/// The button of the tool bar, or of its popovers, that stands for a choice which stays chosen;
/// null if the choice does not stay, or has no button.
QAbstractButton *buttonFor(const StartCall &startCall)
{
    const QStringList tools { QStringLiteral("text"), QStringLiteral("brush"),
        QStringLiteral("eraser") };
    if (startCall.operation == StartCall::Operation::ToolSelection
        && !tools.contains(startCall.argument))
        return nullptr;
    for (QWidget *const widget : QApplication::allWidgets()) {
        auto *const button = qobject_cast<QAbstractButton *>(widget);
        if (button && button->property("identifier").toString() == startCall.argument)
            return button;
    }
    return nullptr;
}

} // namespace

Session::Session()
    : m_penwick(std::make_unique<Penwick>())
{
    // The component is dropped later, not in the notification, because the window is still closing.
    NotificationCenter::defaultCenter().addObserver(
        this, penwickSessionEndNotificationKey(), [this](const platform::Notification &) {
            writePicture();
            QMetaObject::invokeMethod(
                this, [this] { end(); }, Qt::QueuedConnection);
        });
}

Session::~Session()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

bool Session::open(const Options &options, QScreen &screen, const std::optional<QImage> &image)
{
    m_controller = m_penwick->createDrawingWindowController(
        options.windowType, &screen, image, options.title);
    if (!m_controller)
        return false;
    m_announcesSharing = options.announcesSharing;
    m_pictureFile = options.pictureFile;
    m_controller->showWindow(this);
    if (QWindow *const window = m_controller->drawingWindow()->windowHandle()) {
        window->installEventFilter(this);
        if (window->isExposed())
            announceOnceSeen();
    }
    for (const StartCall &startCall : options.startCalls)
        choose(startCall);
    return true;
}

// By a press on the button where there is one, so that the tool bar shows what is chosen. A second
// press on the button of a tool would open its popover.
void Session::choose(const StartCall &startCall)
{
    QAbstractButton *const button = buttonFor(startCall);
    if (button && !button->property("isSelected").toBool())
        button->click();
    else
        call(startCall);
}

void Session::call(const StartCall &call)
{
    QObject *const controller
        = window() ? window()->findChild<QObject *>(QStringLiteral("drawViewController")) : nullptr;
    if (!controller) {
        qWarning("penwick-host: there is no draw view controller to call");
        return;
    }
    const char *const operation = call.operation == StartCall::Operation::ToolSelection
        ? "handleToolSelection"
        : "handleToolOptionSelection";
    QMetaObject::invokeMethod(controller, operation, Q_ARG(QString, call.argument));
}

bool Session::eventFilter(QObject *watched, QEvent *event)
{
    // The first exposure: from now on the window can be seen, and so can a banner over it.
    if (event->type() == QEvent::Expose)
        announceOnceSeen();
    return QObject::eventFilter(watched, event);
}

void Session::announceOnceSeen()
{
    if (std::exchange(m_announcesSharing, false))
        QMetaObject::invokeMethod(this, &Session::announce, Qt::QueuedConnection);
}

void Session::announce()
{
    if (m_penwick)
        m_penwick->showWindowSharingNotification();
}

void Session::close()
{
    if (platform::Window *const open = window())
        open->close();
}

void Session::letGo()
{
    m_controller.reset();
    m_penwick.reset();
}

platform::Window *Session::window() const
{
    return m_controller ? m_controller->drawingWindow() : nullptr;
}

// Must be called before the session is dropped, and the window with it.
void Session::writePicture()
{
    if (!m_pictureFile || !window() || window()->contentImage().save(*m_pictureFile))
        return;
    std::fprintf(stderr, "penwick-host: cannot write the picture '%s'\n",
        m_pictureFile->toLocal8Bit().constData());
    m_status = EXIT_FAILURE;
}

void Session::end()
{
    letGo();
    QCoreApplication::exit(m_status);
}

} // namespace penwick::host
