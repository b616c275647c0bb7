// SPDX-License-Identifier: MIT
// Process-wide notifications by name, delivered at once.
// To connect to a signal of Qt's a host would need its sender, which may be inside the component.
// Here a host names what it wants to hear of, whoever posts it.
#pragma once

#include <penwick/Export.h>

#include <QString>
#include <QVariant>

#include <functional>
#include <memory>
#include <vector>

namespace penwick::platform {

/// What an observer is handed.
struct Notification
{
    QString name;
    QVariant object; ///< invalid where the notification carries none
};

/// Delivers notifications to observers in the order in which they were added. GUI thread only.
class PENWICK_EXPORT NotificationCenter
{
public:
    using Handler = std::function<void(const Notification &)>;

    /// The process's own centre; made on first use, never destroyed.
    static NotificationCenter &defaultCenter();

    NotificationCenter();
    ~NotificationCenter();
    NotificationCenter(const NotificationCenter &) = delete;
    NotificationCenter &operator=(const NotificationCenter &) = delete;

    /// Calls `handler` for every later notification called `name`, or for all of them when `name`
    /// is empty. `observer` is only a key for removeObserver(); it is never dereferenced. The same
    /// observer may be added several times.
    void addObserver(const void *observer, const QString &name, Handler handler);

    /// Drops everything that `observer` added; unknown observers are ignored. An observer that is
    /// removed while a notification is being delivered is not called any more.
    void removeObserver(const void *observer);

    /// Calls the observers of `name` before it returns. Posting, adding and removing from inside a
    /// handler is allowed; observers added meanwhile do not get this notification.
    void postNotification(const QString &name, const QVariant &object = QVariant());

private:
    struct Entry;
    std::vector<std::shared_ptr<Entry>> m_entries;
};

} // namespace penwick::platform
