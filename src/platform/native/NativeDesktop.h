// SPDX-License-Identifier: MIT
// What only the desktop's own protocol can do with a window: one file a desktop behind it.
#pragma once

#include "platform/native/NativeWindowValues.h"

#include <QMargins>
#include <QPoint>
#include <QWindow>

#include <functional>
#include <memory>
#include <optional>

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

    /// Told where the top left corner of a window's frame is, in device pixels of the desktop;
    /// nothing while the window has no frame of the window manager's.
    using FrameListener = std::function<void(std::optional<QPoint> corner)>;

    /// Calls `listener` from now on whenever the window manager moves `window`'s frame, also where
    /// it tells the window itself only at the end, and keeps the window's being dragged by its
    /// title bar from looking like another window's taking over. Replaces an earlier listener of
    /// the same window. Does nothing where the desktop, or the host, leaves no way to know.
    virtual void followFrame(QWindow &window, FrameListener listener);
    /// Ends it; `window` may be gone.
    virtual void forgetFrame(WId window);

    /// Whether a window that is to be left out of captures of the screen is, once it is shown.
    [[nodiscard]] virtual bool keepsWindowsOutOfCaptures() const;
    /// Whether a button of the pointer is held down, over whatever program's window; false where
    /// the desktop does not tell. Asks the desktop: not for the path of a pointer event.
    [[nodiscard]] virtual bool isPointerHeld() const;
    /// Whether transparent pixels of a window show what is below it.
    [[nodiscard]] virtual bool isCompositing() const;
    /// Lets the user resize `window` only to content of the shape `content`; any shape where that
    /// is empty. Wears off when the window is created anew.
    virtual void keepContentRatio(QWindow &window, const QSize &content);
    /// What can be done of `attributes` once `window` is on the screen: on every virtual desktop,
    /// out of captures of the screen.
    virtual void applyAttributes(QWindow &window, const NativeWindowValues &values);
};

/// The desktop of this build's platform; null where the running application is not on it.
std::unique_ptr<NativeDesktop> makeNativeDesktop();

} // namespace penwick::platform
