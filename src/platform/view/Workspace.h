// SPDX-License-Identifier: MIT
// The desktop's increase-contrast setting and the news that it changed.
#pragma once

#include <penwick/platform/NotificationCenter.h>

#include <QObject>

#include <memory>

namespace penwick::platform {

class ContrastSource;

/// What the component wants to know about the user's desktop.
///
/// Nothing here waits for the desktop: until it has answered, and wherever there is no such
/// setting, contrast is normal. GUI thread only.
class Workspace final : public QObject
{
    Q_OBJECT

public:
    /// The workspace of the user's session; made on first use, never destroyed.
    static Workspace &shared();

    /// Takes `contrast`, which becomes a child of the workspace; null: contrast stays normal.
    explicit Workspace(std::unique_ptr<ContrastSource> contrast, QObject *parent = nullptr);
    ~Workspace() override;

    /// Name of the notification posted by notificationCenter() when the value of
    /// accessibilityDisplayShouldIncreaseContrast() has changed; its object is the workspace as a
    /// QObject pointer. The spelling is fixed.
    [[nodiscard]] static QString accessibilityDisplayOptionsDidChangeNotification();

    /// The last value that the desktop told. Kept while the desktop's own service restarts, or when
    /// it is lost.
    [[nodiscard]] bool accessibilityDisplayShouldIncreaseContrast() const;

    /// The workspace's own centre, apart from the process's default one. Posts from the event loop,
    /// never from inside a call to the workspace.
    [[nodiscard]] NotificationCenter &notificationCenter();

private:
    void setContrastIncreased(bool isIncreased);

    bool m_isContrastIncreased = false;
    NotificationCenter m_notificationCenter;
};

} // namespace penwick::platform
