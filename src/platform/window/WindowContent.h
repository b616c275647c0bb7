// SPDX-License-Identifier: MIT
// What fills a window and has its keys: the component's own side of a window, which no host needs.
#pragma once

#include "platform/foundation/WeakReference.h"
#include "platform/view/ViewHost.h"

#include <penwick/platform/WindowResponder.h>

#include <memory>
#include <vector>

namespace penwick::platform {

class FrameTracker;
class ViewController;

/// The views of one window, their controller, and who gets the keys. Held by the window.
class WindowContent final : public ViewHost
{
    Q_OBJECT

public:
    /// Borrows both; `tracker` follows `window`.
    WindowContent(QWidget &window, FrameTracker &tracker);
    ~WindowContent() override;

    [[nodiscard]] View *contentView() const override { return m_contentView; }
    /// Lets `view` fill the window's content. A view from outside is borrowed: it comes into this
    /// window and leaves it again when another one takes its place.
    void setContentView(View *view);
    [[nodiscard]] ViewController *contentViewController() const;
    /// Takes `controller`, whose view must be one of this window's own.
    void setContentViewController(std::unique_ptr<ViewController> controller);
    /// Makes views of the widgets that a scene built in the window, and asks for the size that the
    /// scene gave it.
    void adoptScene();
    /// The views that stand in the window itself, the lowest first.
    [[nodiscard]] std::vector<View *> topViews() const;
    /// Puts them where their frames say; called when the window was resized.
    void place();

    [[nodiscard]] View *firstResponder() const override { return m_firstResponder; }
    bool makeFirstResponder(View *view) override;
    [[nodiscard]] bool isKeyWindow() const override;
    void forgetView(const View &view) override;
    /// Who gets what no view has taken; null without one. Weak.
    [[nodiscard]] WindowResponder *responder() const { return m_responder.get(); }
    void setResponder(WindowResponder *responder) { m_responder = responder; }

    [[nodiscard]] QColor backgroundColor() const override { return m_backgroundColor; }
    void setBackgroundColor(const QColor &color);

    /// The window is being destroyed: nobody has its keys any more, and what is borrowed leaves it.
    void end();

private:
    void releaseContentView();

    QWidget &m_window;
    FrameTracker &m_tracker;
    View *m_contentView = nullptr;
    bool m_isContentBorrowed = false;
    View *m_firstResponder = nullptr;
    WeakReference<WindowResponder> m_responder;
    QColor m_backgroundColor;
    std::unique_ptr<ViewController> m_contentViewController; // the first to go
};

/// The content of `window`, which must be a Window (else the process stops).
[[nodiscard]] WindowContent &contentOf(const QWidget &window);

} // namespace penwick::platform
