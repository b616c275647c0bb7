// SPDX-License-Identifier: MIT
#include "platform/scene/Storyboard.h"

#include "platform/scene/Bundle.h"

namespace penwick::platform {

Storyboard::Storyboard(const QString &name, const Bundle &bundle)
    : m_name(name)
    , m_bundle(bundle)
{ }

std::unique_ptr<QObject> Storyboard::instantiateController(const QString &identifier) const
{
    const Bundle::SceneMaker maker = m_bundle.scene(m_name, identifier);
    return maker ? maker() : nullptr;
}

} // namespace penwick::platform
