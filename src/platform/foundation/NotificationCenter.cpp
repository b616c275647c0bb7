// SPDX-License-Identifier: MIT
#include <penwick/platform/NotificationCenter.h>

#include <algorithm>

namespace penwick::platform {

struct NotificationCenter::Entry
{
    const void *observer = nullptr;
    QString name; // empty: every name
    Handler handler;
    bool isActive = true; // cleared on removal, so that a delivery under way skips it
};

NotificationCenter::NotificationCenter() = default;
NotificationCenter::~NotificationCenter() = default;

NotificationCenter &NotificationCenter::defaultCenter()
{
    // Never destroyed: an observer may still leave while the process ends.
    static NotificationCenter *const center = new NotificationCenter;
    return *center;
}

void NotificationCenter::addObserver(const void *observer, const QString &name, Handler handler)
{
    m_entries.push_back(
        std::make_shared<Entry>(Entry { observer, name, std::move(handler), true }));
}

void NotificationCenter::removeObserver(const void *observer)
{
    std::erase_if(m_entries, [observer](const std::shared_ptr<Entry> &entry) {
        if (entry->observer != observer)
            return false;
        entry->isActive = false;
        return true;
    });
}

void NotificationCenter::postNotification(const QString &name, const QVariant &object)
{
    std::vector<std::shared_ptr<Entry>> receivers;
    std::copy_if(m_entries.begin(), m_entries.end(), std::back_inserter(receivers),
        [&name](const auto &entry) { return entry->name.isEmpty() || entry->name == name; });

    const Notification notification { name, object };
    for (const auto &receiver : receivers) {
        if (receiver->isActive)
            receiver->handler(notification);
    }
}

} // namespace penwick::platform
