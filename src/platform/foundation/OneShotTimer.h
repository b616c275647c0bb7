// SPDX-License-Identifier: MIT
// Something that is done once, later, unless its owner is gone by then.
// A QTimer::singleShot() would live on after the object that it was to call.
#pragma once

#include <QTimer>

namespace penwick::platform {

/// Calls `operation` of `owner` once, after `time` milliseconds. Each call is another timer; all
/// of them go with `owner`.
template <class Owner>
void callLater(Owner &owner, int time, void (Owner::*operation)())
{
    auto *const timer = new QTimer(&owner);
    timer->setSingleShot(true);
    timer->setTimerType(Qt::PreciseTimer);
    QObject::connect(timer, &QTimer::timeout, &owner, operation);
    QObject::connect(timer, &QTimer::timeout, timer, &QObject::deleteLater);
    timer->start(time);
}

} // namespace penwick::platform
