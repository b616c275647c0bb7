// SPDX-License-Identifier: MIT
// Windows. Written to the platform's documentation; it has not been run yet.
#include "platform/native/NativeDesktop.h"

#include <QOperatingSystemVersion>

#include <windows.h>

namespace penwick::platform {

namespace {

class NativeDesktopWindows final : public NativeDesktop
{
public:
    [[nodiscard]] bool keepsWindowsOutOfCaptures() const override
    {
        return QOperatingSystemVersion::current() >= QOperatingSystemVersion::Windows10_2004;
    }

    void applyAttributes(QWindow &window, const WindowAttributes &attributes) override
    {
        SetWindowDisplayAffinity(reinterpret_cast<HWND>(window.winId()),
            attributes.sharingType == SharingType::none ? WDA_EXCLUDEFROMCAPTURE : WDA_NONE);
    }
};

} // namespace

std::unique_ptr<NativeDesktop> makeNativeDesktop()
{
    return std::make_unique<NativeDesktopWindows>();
}

} // namespace penwick::platform
