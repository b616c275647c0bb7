// SPDX-License-Identifier: MIT
// What only the desktop's own protocol can do with a window. Each desktop implements it in a file
// of its own.
#pragma once

#include "platform/native/WindowStanding.h"

#include <penwick/platform/WindowAttributes.h>

#include <QMargins>
#include <QPoint>
#include <QRect>
#include <QWindow>

#include <functional>
#include <memory>
#include <optional>

namespace penwick::platform {

/// The desktop that the application runs on. GUI thread only.
class NativeDesktop
{
public:
    /// The desktop that this process runs on; one whose operations do nothing where no desktop is
    /// known.
    static NativeDesktop &instance();

    virtual ~NativeDesktop() = default;

    /// The title bar and borders that the desktop will put around `window`, which exists but has
    /// not been shown, in device pixels. Nothing where the desktop does not tell beforehand.
    /// Waits for the answer, at most for a few frames.
    virtual std::optional<QMargins> frameMarginsBeforeShow(QWindow &window);

    /// Told where the top left corner of a window's frame is, in device pixels of the desktop;
    /// nothing while the window has no frame of the window manager's.
    using FrameListener = std::function<void(std::optional<QPoint> corner)>;

    /// Calls `listener` from now on whenever the window manager moves the frame of `window`, even
    /// if the window itself is told only at the end of a drag. Also hides from the toolkit the
    /// change of focus during a drag by the title bar, which looks as if another window became
    /// active. Replaces an earlier listener of the same window. Does nothing where the desktop, or
    /// the host, leaves no way to know.
    virtual void followFrame(QWindow &window, FrameListener listener);
    /// Where the content of `window` is, in device pixels of the desktop: the toolkit takes what it
    /// has asked for as granted until it hears otherwise, and some desktops say nothing. Nothing
    /// where the desktop tells by itself, or not at all. Waits for the answer.
    [[nodiscard]] virtual std::optional<QRect> contentOnScreen(QWindow &window) const;
    /// Tells the desktop how `window`, which exists but is not on the screen, is to stand among
    /// other windows. To be told anew before each showing.
    virtual void prepareToShow(QWindow &window, const WindowStanding &standing);
    /// Ends what followFrame() and prepareToShow() have begun for `window`, which may be gone.
    virtual void forget(WId window);

    /// Whether the desktop itself can keep a window out of captures of the screen.
    [[nodiscard]] virtual bool keepsWindowsOutOfCaptures() const;
    /// Whether a button of the pointer is held down, over whatever program's window; false where
    /// the desktop does not tell. Waits for the desktop's answer, so it must not be called for each
    /// event of the pointer.
    [[nodiscard]] virtual bool isPointerHeld() const;
    /// Whether transparent pixels of a window show what is below it.
    [[nodiscard]] virtual bool isCompositing() const;
    /// By how much the hot spot of a picture of `devicePixelRatio` is multiplied when the toolkit
    /// is given it in points: not every desktop's cursors count as its pictures do.
    [[nodiscard]] static double hotSpotScale(double devicePixelRatio);
    /// Lets the user resize `window` only to content of the shape `content`; any shape where that
    /// is empty. Is lost when the native window is created anew.
    virtual void keepContentRatio(QWindow &window, const QSize &content);
    /// Says that `content` is the only size of `window`, so that nobody else resizes it; any size
    /// again where that is empty. Is lost when the native window is created anew.
    virtual void keepContentSize(QWindow &window, const QSize &content);
    /// Applies what the desktop can do of `attributes` once `window` is on the screen, such as
    /// keeping it out of captures.
    virtual void applyAttributes(QWindow &window, const WindowAttributes &attributes);
};

/// The desktop of this build's platform; null where the running application is not on it.
std::unique_ptr<NativeDesktop> makeNativeDesktop();

} // namespace penwick::platform
