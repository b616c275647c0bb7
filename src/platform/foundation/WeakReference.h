// SPDX-License-Identifier: MIT
// A reference to a QObject by one of its contracts, empty once the object is gone.
#pragma once

#include <QObject>
#include <QPointer>

namespace penwick::platform {

/// Holds a delegate without keeping it alive. `Contract` is an abstract class without QObject in
/// it; whoever implements it must be a QObject, which is what tells the reference of its end.
template <class Contract>
class WeakReference
{
public:
    WeakReference() = default;
    WeakReference(Contract *target) // NOLINT(google-explicit-constructor): reads as a pointer
        : m_object(dynamic_cast<QObject *>(target))
        , m_target(target)
    {
        Q_ASSERT_X(!target || m_object, "WeakReference", "the target must be a QObject");
    }

    /// The target; null where there is none or it is gone.
    [[nodiscard]] Contract *get() const { return m_object ? m_target : nullptr; }

private:
    QPointer<QObject> m_object;
    Contract *m_target = nullptr;
};

} // namespace penwick::platform
