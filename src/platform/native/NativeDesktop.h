// SPDX-License-Identifier: MIT
// What only the desktop's own protocol can do with a window: one file a desktop behind it.
#pragma once

#include <QMargins>

#include <memory>
#include <optional>

class QWindow;

namespace penwick::platform {

/// The desktop that the application runs on. GUI thread only.
class NativeDesktop
{
public:
    /// The one that this process was started on; one that does nothing where there is no protocol
    /// to speak.
    static NativeDesktop &instance();

    virtual ~NativeDesktop() = default;

    /// The title bar and borders that the desktop will put around `window`, which exists but has
    /// not been shown, in device pixels. Nothing where the desktop does not tell beforehand.
    /// Waits for the answer, at most for a few frames.
    virtual std::optional<QMargins> frameMarginsBeforeShow(QWindow &window);
};

/// The desktop of this build's platform; null where the running application is not on it.
std::unique_ptr<NativeDesktop> makeNativeDesktop();

} // namespace penwick::platform
