// SPDX-License-Identifier: MIT
#include "platform/view/Workspace.h"

#include "platform/native/ContrastSource.h"

namespace penwick::platform {

Workspace &Workspace::shared()
{
    // Never destroyed: observers may still leave while the process ends, and what the desktop is
    // asked through may be gone by then.
    static auto *const workspace = new Workspace(makeContrastSource());
    return *workspace;
}

Workspace::Workspace(std::unique_ptr<ContrastSource> contrast, QObject *parent)
    : QObject(parent)
{
    if (!contrast)
        return;
    connect(contrast.get(), &ContrastSource::told, this, &Workspace::setContrastIncreased);
    contrast.release()->setParent(this);
}

Workspace::~Workspace() = default;

QString Workspace::accessibilityDisplayOptionsDidChangeNotification()
{
    return QStringLiteral("NSWorkspaceAccessibilityDisplayOptionsDidChangeNotification");
}

bool Workspace::accessibilityDisplayShouldIncreaseContrast() const
{
    return m_isContrastIncreased;
}

NotificationCenter &Workspace::notificationCenter()
{
    return m_notificationCenter;
}

void Workspace::setContrastIncreased(bool isIncreased)
{
    if (m_isContrastIncreased == isIncreased)
        return;
    m_isContrastIncreased = isIncreased;
    m_notificationCenter.postNotification(
        accessibilityDisplayOptionsDidChangeNotification(), QVariant::fromValue<QObject *>(this));
}

} // namespace penwick::platform
