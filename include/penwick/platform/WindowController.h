// SPDX-License-Identifier: MIT
// The owner of a window.
#pragma once

#include <penwick/Export.h>

#include <QObject>

#include <memory>

class QKeyEvent;

namespace penwick::platform {

class Window;

/// Holds a window and keeps it alive; the window goes with its controller. GUI thread only:
/// anywhere else, and where there is no QApplication, its operations stop the process.
class PENWICK_EXPORT WindowController : public QObject
{
    Q_OBJECT

public:
    WindowController();
    /// Takes `window`, which did not come from a scene: windowDidLoad() is not run. Null: none.
    explicit WindowController(std::unique_ptr<Window> window);
    ~WindowController() override;

    /// The window; null before it was loaded.
    [[nodiscard]] Window *window() const;
    /// Takes `window` and runs windowDidLoad(). Called once.
    void setWindow(std::unique_ptr<Window> window);

    /// Shows the window in front of the others and makes it the key window, if it is one that can
    /// be. `sender` is whoever asks; it is not used.
    Q_INVOKABLE void showWindow(QObject *sender);

    /// Takes the window, and the windows that belong to it, off the screen. No end is announced.
    void retire();

    /// The window has been loaded.
    virtual void windowDidLoad();
    /// The left button went down where no view of the window took it.
    virtual void mouseDown();
    /// It was let go again.
    virtual void mouseUp();
    /// A key went down that no view of the window took; answers whether it does something here.
    virtual bool keyDown(const QKeyEvent &event);

private:
    std::unique_ptr<Window> m_window;
};

} // namespace penwick::platform
