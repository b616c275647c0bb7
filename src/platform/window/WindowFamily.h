// SPDX-License-Identifier: MIT
// Which windows stand above which, and are on the screen only together.
#pragma once

#include <vector>

namespace penwick::platform {

class Window;

/// One window's place among its parent and its children. Held by the window.
class WindowFamily
{
public:
    /// Takes no more than the address of `window`.
    explicit WindowFamily(Window &window);
    ~WindowFamily();
    WindowFamily(const WindowFamily &) = delete;
    WindowFamily &operator=(const WindowFamily &) = delete;

    /// Null without one.
    [[nodiscard]] Window *parent() const;
    /// In the order of adding.
    [[nodiscard]] std::vector<Window *> children() const;
    /// Makes `child`, whose parent may be another one, the last of the children.
    void add(WindowFamily &child);
    /// Without a parent nothing happens.
    void leaveParent();

    /// Whether the window was asked to the screen: it is there, or will be as soon as its parent
    /// is.
    [[nodiscard]] bool isOrderedIn() const { return m_isOrderedIn; }
    void setOrderedIn(bool isOrderedIn) { m_isOrderedIn = isOrderedIn; }

private:
    Window &m_window;
    WindowFamily *m_parent = nullptr;
    std::vector<WindowFamily *> m_children;
    bool m_isOrderedIn = false;
};

} // namespace penwick::platform
