// SPDX-License-Identifier: MIT
#include "platform/native/NativeDesktop.h"

#include <QGuiApplication>
#include <QPointer>

namespace penwick::platform {

NativeDesktop &NativeDesktop::instance()
{
    // One for each application object, because the connection to the desktop ends with it.
    static QPointer<QObject> application;
    static std::unique_ptr<NativeDesktop> desktop;
    if (!desktop || application != qApp) {
        application = qApp;
        desktop = makeNativeDesktop();
        if (!desktop)
            desktop = std::make_unique<NativeDesktop>();
    }
    return *desktop;
}

std::optional<QMargins> NativeDesktop::frameMarginsBeforeShow(QWindow &)
{
    return std::nullopt;
}

// NOLINTNEXTLINE(performance-unnecessary-value-param): a desktop that can follow keeps it
void NativeDesktop::followFrame(QWindow &, FrameListener) { }

std::optional<QRect> NativeDesktop::contentOnScreen(QWindow &) const
{
    return std::nullopt;
}

void NativeDesktop::prepareToShow(QWindow &, const WindowStanding &) { }

void NativeDesktop::forget(WId) { }

bool NativeDesktop::keepsWindowsOutOfCaptures() const
{
    return false;
}

bool NativeDesktop::isPointerHeld() const
{
    return false;
}

bool NativeDesktop::isCompositing() const
{
    return true;
}

// X11 takes the hot spot in device pixels and Qt hands it on as it is given; elsewhere Qt scales.
double NativeDesktop::hotSpotScale(double devicePixelRatio)
{
    return QGuiApplication::platformName() == QStringLiteral("xcb") ? devicePixelRatio : 1.0;
}

void NativeDesktop::keepContentRatio(QWindow &, const QSize &) { }

void NativeDesktop::keepContentSize(QWindow &, const QSize &) { }

void NativeDesktop::applyAttributes(QWindow &, const WindowAttributes &) { }

} // namespace penwick::platform
