// SPDX-License-Identifier: MIT
#include <penwick/Penwick.h>

#include "appearance/PenwickBundle.h"
#include "history/NotificationNames.h"
#include "platform/foundation/FatalError.h"
#include "platform/foundation/GuiThread.h"
#include "platform/foundation/StandardOutput.h"
#include "session/ComponentBundle.h"

namespace penwick {

namespace {

// A host often lets go of a controller inside an event of the controller's own window. So the
// window leaves the screen at once, and both are deleted from the event loop.
std::shared_ptr<DrawingWindowController> shared(std::unique_ptr<DrawingWindowController> controller)
{
    if (!controller)
        return nullptr;
    return { controller.release(), [](DrawingWindowController *last) {
                last->retire();
                last->deleteLater();
            } };
}

} // namespace

const QString &penwickSessionEndNotificationKey()
{
    static const auto *const name
        = new QString(notificationPrefix() + QStringLiteral(".penwick.session.end"));
    return *name;
}

Penwick::Penwick()
{
    platform::requireApplication();
    setPenwickBundle(makeComponentBundle());
}

Penwick::~Penwick()
{
    platform::requireGuiThreadAtEnd();
}

std::shared_ptr<DrawingWindowController> Penwick::penwickWindowController() const
{
    platform::requireGuiThread();
    return m_penwickWindowController;
}

void Penwick::setPenwickWindowController(std::shared_ptr<DrawingWindowController> controller)
{
    platform::requireGuiThread();
    m_penwickWindowController = std::move(controller);
}

std::shared_ptr<DrawingWindowController> Penwick::createDrawingWindowController(
    WindowType windowType, QScreen *drawScreen, const std::optional<QImage> &annotatedImage,
    const std::optional<QString> &windowTitle)
{
    platform::requireGuiThread();
    const auto &bundle = platform::require(penwickBundle(), "the resource bundle is not set");
    m_penwickWindowController = shared(bundle->instantiate<DrawingWindowController>(
        QStringLiteral("Main"), QStringLiteral("DrawingWindowController")));
    if (!m_penwickWindowController) {
        platform::printLine("Not able to create Penwick WindowController!");
        return nullptr;
    }
    QScreen &screen = *platform::require(drawScreen, "a drawing window needs a screen");
    m_penwickWindowController->createWindowForApplication(
        windowType, screen, annotatedImage, windowTitle);
    return m_penwickWindowController;
}

void Penwick::showWindowSharingNotification()
{
    platform::requireGuiThread();
    if (m_penwickWindowController)
        m_penwickWindowController->showSharingNotificationWindow();
}

} // namespace penwick
