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
    /// Makes what an interface file holds and connects it to its owner, which must be of the class
    /// that the file is made for.
    using InterfaceLoader = std::function<void(QObject &owner)>;

    /// `imagePath` is the resource folder of the artwork, without a slash at its end.
    explicit Bundle(const QString &imagePath);

    /// The artwork called `name`, sharp at every size and scale; a null icon where there is none.
    [[nodiscard]] QIcon imageForResource(const QString &name) const;

    /// Adds the scene `identifier` to the storyboard `storyboard`.
    void addScene(const QString &storyboard, const QString &identifier, const SceneMaker &maker);
    /// A new, loaded controller of that scene; null where there is no such scene. Its class is the
    /// scene's: the caller tests for the one it needs.
    [[nodiscard]] std::unique_ptr<QObject> instantiateController(
        const QString &storyboard, const QString &identifier) const;
    /// The same, as `Controller`; null where there is no such scene or it is of another class.
    template <class Controller>
    [[nodiscard]] std::unique_ptr<Controller> instantiate(
        const QString &storyboard, const QString &identifier) const
    {
        std::unique_ptr<QObject> object = instantiateController(storyboard, identifier);
        auto *const controller = dynamic_cast<Controller *>(object.get());
        if (controller)
            static_cast<void>(object.release());
        return std::unique_ptr<Controller>(controller);
    }

    /// Adds the interface file `name`.
    void addInterface(const QString &name, const InterfaceLoader &loader);
    /// Its loader; empty where there is none.
    [[nodiscard]] InterfaceLoader interfaceLoader(const QString &name) const;

private:
    QString m_imagePath;
    QHash<QString, QHash<QString, SceneMaker>> m_storyboards;
    QHash<QString, InterfaceLoader> m_interfaces;
};

} // namespace penwick::platform
