// SPDX-License-Identifier: MIT
#include "session/ComponentBundle.h"

#include "session/DrawingWindowScene.h"

namespace penwick {

std::shared_ptr<platform::Bundle> makeComponentBundle()
{
    auto bundle = std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images"));
    const QString main = QStringLiteral("Main");
    bundle->addScene(main, QStringLiteral("DrawingWindowController"), makeDrawingWindowScene);
    return bundle;
}

} // namespace penwick
