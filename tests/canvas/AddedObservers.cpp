// SPDX-License-Identifier: MIT
#include "canvas/AddedObservers.h"

#include <penwick/platform/NotificationCenter.h>

#include <utility>
#include <vector>

using penwick::platform::NotificationCenter;

namespace {

std::vector<std::pair<const void *, QString>> added;

} // namespace

// The two names that the linker gives a function that it wraps.
#define ADD_OBSERVER                                                                               \
    "_ZN7penwick8platform18NotificationCenter11addObserverEPKvRK7QStringSt8functionIFvRKNS0_"      \
    "12NotificationEEE"

void addObserver(NotificationCenter *center, const void *observer, const QString &name,
    NotificationCenter::Handler handler) __asm__("__real_" ADD_OBSERVER);

void noteObserver(NotificationCenter *center, const void *observer, const QString &name,
    NotificationCenter::Handler handler) __asm__("__wrap_" ADD_OBSERVER);

void noteObserver(NotificationCenter *center, const void *observer, const QString &name,
    NotificationCenter::Handler handler)
{
    added.emplace_back(observer, name);
    addObserver(center, observer, name, std::move(handler));
}

namespace penwick::test {

QStringList namesObservedBy(const void *observer)
{
    QStringList names;
    for (const auto &[who, name] : added) {
        if (who == observer)
            names.append(name);
    }
    return names;
}

} // namespace penwick::test
