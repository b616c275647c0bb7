// SPDX-License-Identifier: MIT
// The component's resources: artwork by name, and what its storyboards hold.
#pragma once

#include <QHash>
#include <QIcon>
#include <QObject>
#include <QString>

#include <functional>
#include <memory>

namespace penwick::platform {

/// Resources that were compiled in under one path, and the scenes made from interface files.
/// GUI thread only.
class Bundle
{
public:
    /// Makes what a scene holds, complete and loaded.
    using SceneMaker = std::function<std::unique_ptr<QObject>()>;

    /// `imagePath` is the resource folder of the artwork, without a slash at its end.
    explicit Bundle(const QString &imagePath);

    /// The artwork called `name`, sharp at every size and scale; a null icon where there is none.
    [[nodiscard]] QIcon imageForResource(const QString &name) const;

    /// Adds the scene `identifier` to the storyboard `storyboard`.
    void addScene(const QString &storyboard, const QString &identifier, SceneMaker maker);
    /// The maker of that scene; empty where there is none.
    [[nodiscard]] SceneMaker scene(const QString &storyboard, const QString &identifier) const;

private:
    QString m_imagePath;
    QHash<QString, QHash<QString, SceneMaker>> m_storyboards;
};

} // namespace penwick::platform
