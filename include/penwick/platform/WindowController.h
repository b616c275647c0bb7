// SPDX-License-Identifier: MIT
// The owner of a window.
#pragma once

#include <penwick/Export.h>
#include <penwick/platform/WindowResponder.h>

#include <QObject>

#include <memory>

namespace penwick::platform {

class Window;

/// Owns a window, which is destroyed together with its controller. GUI thread only: on another
/// thread, or without a QApplication, its operations stop the process.
class PENWICK_EXPORT WindowController : public QObject, public WindowResponder
{
    Q_OBJECT

public:
    WindowController();
    /// Takes `window`, which may be null. It did not come from a scene, so windowDidLoad() is not
    /// called.
    explicit WindowController(std::unique_ptr<Window> window);
    ~WindowController() override;

    /// The window; null before it was loaded.
    [[nodiscard]] Window *window() const;
    /// Takes `window` and runs windowDidLoad(). Called once.
    void setWindow(std::unique_ptr<Window> window);

    /// Shows the window in front of the others and makes it the key window, if it is one that can
    /// be. `sender` is whoever asks; it is not used.
    Q_INVOKABLE void showWindow(QObject *sender);

    /// Takes the window and its child windows off the screen. Unlike Window::close() it announces
    /// no end.
    void retire();

    /// The window has been loaded.
    virtual void windowDidLoad();
    void mouseDown() override;
    void mouseUp() override;
    bool keyDown(const QKeyEvent &event) override;

private:
    std::unique_ptr<Window> m_window;
};

} // namespace penwick::platform
