// SPDX-License-Identifier: MIT
#include "EventLog.h"

#include <penwick/Penwick.h>
#include <penwick/platform/NotificationCenter.h>

#include <QAbstractButton>
#include <QApplication>
#include <QEvent>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QScreen>
#include <QTimer>
#include <QWindow>

#include <cstdio>

namespace penwick::host {

namespace {

using platform::NotificationCenter;

// A window that has not changed for this long has come to rest. The steps of a glide or a drag
// follow each other much faster.
constexpr int restTime = 80; // milliseconds

QSet<QString> notificationNames()
{
    const QString &end = penwickSessionEndNotificationKey();
    const QString endSuffix = QStringLiteral(".penwick.session.end");
    Q_ASSERT(end.endsWith(endSuffix));
    const QString prefix = end.chopped(endSuffix.size());
    return { end, prefix + QLatin1String(".penwik.notification"),
        prefix + QLatin1String(".penwick.notification.drawingview.update"),
        prefix + QLatin1String(".penwick.notification.drawsubview.update") };
}

bool isWindowOfComponent(const QObject &object)
{
    static const QSet<QString> names { QStringLiteral("drawing"), QStringLiteral("toolPanel"),
        QStringLiteral("popover"), QStringLiteral("banner") };
    const auto *const widget = qobject_cast<const QWidget *>(&object);
    return widget && widget->isWindow() && names.contains(widget->objectName());
}

// The component's widget whose native window is `window`; null if there is none.
QWidget *widgetOf(const QWindow &window)
{
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        if (widget->windowHandle() == &window && isWindowOfComponent(*widget))
            return widget;
    }
    return nullptr;
}

// Qt gives the corner of a screen in device pixels, and counts points from that corner.
QPointF toDevicePixels(QPointF place, const QWidget &window)
{
    const QPointF corner = window.screen()->geometry().topLeft();
    return corner + (place - corner) * window.devicePixelRatioF();
}

QByteArray json(const QJsonValue &value)
{
    const QByteArray inBrackets
        = QJsonDocument(QJsonArray { value }).toJson(QJsonDocument::Compact);
    return inBrackets.mid(1, inBrackets.size() - 2);
}

QJsonArray frameOf(const QWidget &window)
{
    const QRectF frame
        = window.windowHandle() ? window.windowHandle()->frameGeometry() : window.frameGeometry();
    const QPoint topLeft = toDevicePixels(frame.topLeft(), window).toPoint();
    const QPoint bottomRight = toDevicePixels(frame.bottomRight(), window).toPoint();
    return { topLeft.x(), topLeft.y(), bottomRight.x() - topLeft.x(),
        bottomRight.y() - topLeft.y() };
}

QJsonObject buttonsOf(const QWidget &window)
{
    QJsonObject buttons;
    for (const QAbstractButton *const button : window.findChildren<QAbstractButton *>()) {
        const QString identifier = button->property("identifier").toString();
        if (identifier.isEmpty() || !button->isVisible() || button->window() != &window)
            continue;
        const QPointF origin = button->mapToGlobal(QPointF(0, 0));
        const QPointF centre = origin + QPointF(button->width(), button->height()) / 2;
        const QPoint place = toDevicePixels(centre, window).toPoint();
        buttons.insert(identifier, QJsonArray { place.x(), place.y() });
    }
    return buttons;
}

void writeLine(const QByteArray &line)
{
    std::fwrite(line.constData(), 1, static_cast<std::size_t>(line.size()), stdout);
    std::fputc('\n', stdout);
    std::fflush(stdout);
}

} // namespace

EventLog::EventLog()
    : m_notificationNames(notificationNames())
{
    NotificationCenter::defaultCenter().addObserver(this, QString(),
        [this](const platform::Notification &notification) { writeNotification(notification); });
    QCoreApplication::instance()->installEventFilter(this);
}

EventLog::~EventLog()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

bool EventLog::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::Expose) {
        // By the first exposure the window manager's title bar is known.
        const auto *const window = qobject_cast<const QWindow *>(watched);
        if (QWidget *const widget = window ? widgetOf(*window) : nullptr)
            windowChanged(*widget);
        return false;
    }
    if (!isWindowOfComponent(*watched))
        return false;
    QWidget &window = *static_cast<QWidget *>(watched);
    switch (event->type()) {
    case QEvent::Show:
        if (!event->spontaneous())
            windowShown(window);
        break;
    case QEvent::Hide:
        if (!event->spontaneous())
            windowHidden(window);
        break;
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::LayoutRequest:
        windowChanged(window);
        break;
    default:
        break;
    }
    return false;
}

void EventLog::writeNotification(const platform::Notification &notification)
{
    if (!m_notificationNames.contains(notification.name))
        return;
    writeLine("{\"event\":\"notification\",\"name\":" + json(notification.name)
        + ",\"object\":" + json(QJsonValue::fromVariant(notification.object)) + '}');
}

void EventLog::windowChanged(QWidget &window)
{
    if (window.isVisible())
        recordOf(window).rest->start(restTime);
}

void EventLog::windowShown(QWidget &window)
{
    WindowRecord &record = recordOf(window);
    record.isShownUnsaid = true;
    record.rest->start(restTime);
}

void EventLog::windowHidden(QWidget &window)
{
    WindowRecord &record = recordOf(window);
    record.rest->stop();
    // A window that is hidden before it came to rest has been shown too; that is written first.
    if (record.isShownUnsaid)
        writeWindow(window, true);
    writeWindow(window, false);
}

void EventLog::writeWindow(QWidget &window, bool isVisible)
{
    WindowRecord &record = recordOf(window);
    const QByteArray line = "{\"event\":\"window\",\"name\":" + json(window.objectName())
        + ",\"visible\":" + (isVisible ? "true" : "false") + ",\"rect\":" + json(frameOf(window))
        + ",\"buttons\":" + json(buttonsOf(window)) + '}';
    record.isShownUnsaid = false;
    if (line == record.lastLine)
        return;
    record.lastLine = line;
    writeLine(line);
}

EventLog::WindowRecord &EventLog::recordOf(QWidget &window)
{
    const auto found = m_windows.find(&window);
    if (found != m_windows.end())
        return *found;
    WindowRecord &record = m_windows[&window];
    record.rest = new QTimer(this);
    record.rest->setSingleShot(true);
    QWidget *const key = &window;
    connect(record.rest, &QTimer::timeout, this, [this, key] {
        // An unexposed window has not been placed yet; its first exposure starts the timer again.
        if (key->isVisible() && key->windowHandle() && key->windowHandle()->isExposed())
            writeWindow(*key, true);
    });
    connect(key, &QObject::destroyed, this, [this, key] { delete m_windows.take(key).rest; });
    return record;
}

} // namespace penwick::host
