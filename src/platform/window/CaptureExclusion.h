// SPDX-License-Identifier: MIT
// Which windows a capture of the screen is to leave out, where a desktop cannot do that itself.
#pragma once

#include <QObject>
#include <QPointer>
#include <QWindow>

#include <vector>

namespace penwick::platform {

class Window;

/// One window's part in that: itself, if it is not to be seen by a capture, and what stands above
/// it or will. Held by the window.
class CaptureExclusion final : public QObject
{
public:
    explicit CaptureExclusion(Window &window);

    /// Counts `child` and those above it from now on, and no longer where it belonged before.
    void add(CaptureExclusion &child);
    /// The native identifiers of those that are not to be seen, the window itself first; makes the
    /// native windows that are not there yet.
    [[nodiscard]] std::vector<WId> identifiers();
    /// Something may have changed: tells so, here and in the windows below, if it has.
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
    std::vector<Known> m_known; // what the window's own news is held against
};

} // namespace penwick::platform
