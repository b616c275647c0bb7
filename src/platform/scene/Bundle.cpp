// SPDX-License-Identifier: MIT
#include "platform/scene/Bundle.h"

#include "platform/scene/SvgIconEngine.h"

#include <QFile>

namespace penwick::platform {

Bundle::Bundle(const QString &imagePath)
    : m_imagePath(imagePath)
{ }

QIcon Bundle::imageForResource(const QString &name) const
{
    const QString file = m_imagePath + QLatin1Char('/') + name + QStringLiteral(".svg");
    return QFile::exists(file) ? QIcon(new SvgIconEngine(file)) : QIcon();
}

void Bundle::addScene(const QString &storyboard, const QString &identifier, const SceneMaker &maker)
{
    m_storyboards[storyboard].insert(identifier, maker);
}

std::unique_ptr<QObject> Bundle::instantiateController(
    const QString &storyboard, const QString &identifier) const
{
    const SceneMaker maker = m_storyboards.value(storyboard).value(identifier);
    return maker ? maker() : nullptr;
}

void Bundle::addInterface(const QString &name, const InterfaceLoader &loader)
{
    m_interfaces.insert(name, loader);
}

Bundle::InterfaceLoader Bundle::interfaceLoader(const QString &name) const
{
    return m_interfaces.value(name);
}

} // namespace penwick::platform
