// SPDX-License-Identifier: MIT
#include "session/ComponentBundle.h"

#include "session/DrawingWindowScene.h"
#include "session/SharingNotificationScene.h"
#include "session/ToolPanelScene.h"
#include "toolpanel/PopoverInterface.h"

namespace penwick {

std::shared_ptr<platform::Bundle> makeComponentBundle()
{
    auto bundle = std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images"));
    const QString main = QStringLiteral("Main");
    bundle->addScene(main, QStringLiteral("DrawingWindowController"), makeDrawingWindowScene);
    bundle->addScene(
        main, QStringLiteral("SharingNotificationWindowController"), makeSharingNotificationScene);
    // These functions may refer to the bundle, because they live only as long as it does.
    const platform::Bundle &images = *bundle;
    bundle->addScene(main, QStringLiteral("ToolPanelWindowController"),
        [&images] { return makeToolPanelScene(images); });
    bundle->addInterface(QStringLiteral("CommonPopoverView"),
        [&images](QObject &owner) { loadPopoverInterface(owner, images); });
    return bundle;
}

} // namespace penwick
