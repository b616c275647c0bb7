// SPDX-License-Identifier: MIT
// Which windows a capture of the screen is to leave out, where a desktop cannot do that itself.
#pragma once

#include <QObject>
#include <QPointer>
#include <QWindow>

#include <vector>

namespace penwick::platform {

class Window;

/// Knows, for one window, which windows these are: the window itself, if it is not to be seen, and
/// of the windows above it, or expected above it, those that are not. Held by the window.
class CaptureExclusion final : public QObject
{
public:
    explicit CaptureExclusion(Window &window);

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

private:
    struct Known
    {
        const Window *window;
        WId identifier; // 0 before it was asked for
    };

    [[nodiscard]] std::vector<Window *> windows() const;
    [[nodiscard]] bool isAsKnown(const std::vector<Known> &present) const;
    void onChildGone();

    Window &m_window;
    QPointer<CaptureExclusion> m_parent;
    std::vector<QPointer<CaptureExclusion>> m_children; // in the order of adding
    std::vector<Known> m_known; // as it was last asked for or told of
};

} // namespace penwick::platform
