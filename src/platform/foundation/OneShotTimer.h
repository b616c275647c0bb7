// SPDX-License-Identifier: MIT
// Something that is done once, later, unless its owner is gone by then.
// The toolkit's own one-shots outlive the object that they were to call, and fire into nothing.
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
