// SPDX-License-Identifier: MIT
// Which windows a capture of the screen is to leave out, where a desktop cannot do that itself.
#pragma once

#include <QObject>
#include <QPointer>
#include <QWidget>

#include <vector>

namespace penwick::platform {

/// Knows, for one window, which windows these are: the window itself, if it is not to be seen, and
/// of the windows above it, or expected above it, those that are not. Held by the window.
class CaptureExclusion final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `window`.
    explicit CaptureExclusion(QWidget &window);

    /// Whether the window itself is not to be seen; check() tells of it.
    void setLeftOut(bool isLeftOut) { m_isLeftOut = isLeftOut; }
    /// Counts `child` and those above it from now on, and no longer where it belonged before.
    void add(CaptureExclusion &child);
    /// Counts `child` and those above it no longer; nothing where it is not counted here.
    void remove(CaptureExclusion &child);
    /// The native identifiers of those that are not to be seen, the window itself first; makes the
    /// native windows that are not there yet.
    [[nodiscard]] std::vector<WId> identifiers();
    /// To be called when something may have changed. If it has, the window's signal tells so, and
    /// the windows below check too.
    void check();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// identifiers() is another list than when it was last asked for, or told of.
    void changed();

private:
    struct Known
    {
        const QWidget *window;
        WId identifier; // 0 before it was asked for
    };

    [[nodiscard]] std::vector<QWidget *> windows() const;
    [[nodiscard]] bool isAsKnown(const std::vector<Known> &present) const;
    void onChildGone();

    QWidget &m_window;
    bool m_isLeftOut = false;
    QPointer<CaptureExclusion> m_parent;
    std::vector<QPointer<CaptureExclusion>> m_children; // in the order of adding
    std::vector<Known> m_known; // as it was last asked for or told of
};

} // namespace penwick::platform
