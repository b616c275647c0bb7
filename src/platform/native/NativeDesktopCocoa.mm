// SPDX-License-Identifier: MIT
// macOS. Written to the platform's documentation; it has not been run yet.
#include "platform/native/NativeDesktop.h"

#include <QOperatingSystemVersion>

#import <AppKit/AppKit.h>

namespace penwick::platform {

namespace {

class NativeDesktopCocoa final : public NativeDesktop
{
public:
    [[nodiscard]] bool keepsWindowsOutOfCaptures() const override
    {
        // From macOS 15 on, captures of the screen ignore the sharing type.
        return QOperatingSystemVersion::current()
            < QOperatingSystemVersion(QOperatingSystemVersion::MacOS, 15);
    }

    void keepContentRatio(QWindow &window, const QSize &content) override
    {
        NSWindow *const native = nativeWindow(window);
        if (content.isEmpty())
            native.resizeIncrements = NSMakeSize(1.0, 1.0); // which removes the ratio
        else
            native.contentAspectRatio = NSMakeSize(content.width(), content.height());
    }

    void applyAttributes(QWindow &window, const WindowAttributes &attributes) override
    {
        NSWindow *const native = nativeWindow(window);
        native.styleMask = attributes.styleMask.toInt();
        native.collectionBehavior = attributes.collectionBehavior.toInt();
        native.level = static_cast<NSWindowLevel>(attributes.level);
        native.sharingType = static_cast<NSWindowSharingType>(attributes.sharingType);
        native.titleVisibility = static_cast<NSWindowTitleVisibility>(attributes.titleVisibility);
        native.titlebarAppearsTransparent = attributes.titlebarAppearsTransparent;
        native.animationBehavior
            = static_cast<NSWindowAnimationBehavior>(attributes.animationBehavior);
        native.hasShadow = attributes.hasShadow;
    }

private:
    static NSWindow *nativeWindow(QWindow &window)
    {
        return reinterpret_cast<NSView *>(window.winId()).window;
    }
};

} // namespace

std::unique_ptr<NativeDesktop> makeNativeDesktop()
{
    return std::make_unique<NativeDesktopCocoa>();
}

} // namespace penwick::platform
