// SPDX-License-Identifier: MIT
// Scenes by identifier.
#pragma once

#include <QObject>
#include <QString>

#include <memory>

namespace penwick::platform {

class Bundle;

/// One storyboard of a bundle. GUI thread only.
class Storyboard
{
public:
    /// Borrows `bundle` for as long as this object is used.
    Storyboard(const QString &name, const Bundle &bundle);

    /// A new, loaded controller of the scene `identifier`; null where there is no such scene. Its
    /// class is the scene's: the caller tests for the one it needs.
    [[nodiscard]] std::unique_ptr<QObject> instantiateController(const QString &identifier) const;

    /// The same, as `Controller`; null where there is no such scene or it is of another class.
    template <class Controller>
    [[nodiscard]] std::unique_ptr<Controller> instantiate(const QString &identifier) const
    {
        std::unique_ptr<QObject> object = instantiateController(identifier);
        auto *const controller = dynamic_cast<Controller *>(object.get());
        if (controller)
            static_cast<void>(object.release());
        return std::unique_ptr<Controller>(controller);
    }

private:
    QString m_name;
    const Bundle &m_bundle;
};

} // namespace penwick::platform
