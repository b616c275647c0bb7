// SPDX-License-Identifier: MIT
#include "platform/native/NativeDesktop.h"

namespace penwick::platform {

NativeDesktop &NativeDesktop::instance()
{
    static const std::unique_ptr<NativeDesktop> desktop = [] {
        auto native = makeNativeDesktop();
        return native ? std::move(native) : std::make_unique<NativeDesktop>();
    }();
    return *desktop;
}

std::optional<QMargins> NativeDesktop::frameMarginsBeforeShow(QWindow &)
{
    return std::nullopt;
}

} // namespace penwick::platform
