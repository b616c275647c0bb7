// SPDX-License-Identifier: MIT
// The desktop's increase-contrast setting, in a test's hand.
#pragma once

#include "platform/native/ContrastSource.h"
#include "platform/view/Workspace.h"

namespace penwick::test {

/// Tells the process's workspace what the desktop would tell it. Normal contrast before
/// and after. Must be there before the first button is, so that no bus has been joined.
class ContrastSetting final
{
public:
    ContrastSetting() { qputenv("DBUS_SESSION_BUS_ADDRESS", "unix:path=/nonexistent"); }
    ~ContrastSetting() { setIncreased(false); }
    ContrastSetting(const ContrastSetting &) = delete;
    ContrastSetting &operator=(const ContrastSetting &) = delete;

    static void setIncreased(bool isIncreased)
    {
        auto *const source = platform::Workspace::shared().findChild<platform::ContrastSource *>();
        Q_EMIT source->told(isIncreased);
    }
};

} // namespace penwick::test
