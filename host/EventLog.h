// SPDX-License-Identifier: MIT
// What "--log" writes: the component's notifications and its windows, as a stranger sees them.
#pragma once

#include <QByteArray>
#include <QHash>
#include <QObject>
#include <QSet>
#include <QString>

class QTimer;
class QWidget;

namespace penwick::platform {
struct Notification;
}

namespace penwick::host {

/// Writes one JSON object a line to standard output, flushed at once.
///
/// A notification is written before any observer that was added later hears of it. A window is
/// written when it is hidden, and when it has come to rest after it was shown, moved or resized:
/// only then is its frame what the window manager made of it.
class EventLog final : public QObject
{
public:
    EventLog();
    ~EventLog() override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    struct WindowRecord
    {
        QTimer *rest = nullptr; // started anew by every change; owned by the log
        QByteArray lastLine;
        bool isShownUnsaid = false; // shown, but that is not written yet
    };

    void writeNotification(const platform::Notification &notification);
    void windowChanged(QWidget &window);
    void windowShown(QWidget &window);
    void windowHidden(QWidget &window);
    void writeWindow(QWidget &window, bool isVisible);
    WindowRecord &recordOf(QWidget &window);

    const QSet<QString> m_notificationNames;
    QHash<QWidget *, WindowRecord> m_windows;
};

} // namespace penwick::host
