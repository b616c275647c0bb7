// SPDX-License-Identifier: MIT
// Windows. Written to the platform's documentation; it has not been run yet.
#include "platform/native/NativeDesktop.h"

#include <windows.h>

namespace penwick::platform {

namespace {

class NativeDesktopWindows final : public NativeDesktop
{
public:
    void applyAttributes(QWindow &window, const NativeWindowValues &values) override
    {
        SetWindowDisplayAffinity(reinterpret_cast<HWND>(window.winId()),
            values.isLeftOutOfCaptures ? WDA_EXCLUDEFROMCAPTURE : WDA_NONE);
    }
};

} // namespace

std::unique_ptr<NativeDesktop> makeNativeDesktop()
{
    return std::make_unique<NativeDesktopWindows>();
}

} // namespace penwick::platform
