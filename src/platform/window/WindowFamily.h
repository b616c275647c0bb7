// SPDX-License-Identifier: MIT
// Which windows stand above which, and are on the screen only together.
#pragma once

#include <QPoint>
#include <QPointer>

#include <vector>

namespace penwick::platform {

class Window;

/// One window's place among its parent and its children. Held by the window.
class WindowFamily
{
public:
    [[nodiscard]] Window *parent() const { return m_parent; }
    /// In the order of adding.
    [[nodiscard]] std::vector<Window *> children() const;
    void add(Window &child);
    void remove(const Window &child);
    void setParent(Window *parent) { m_parent = parent; }

    /// Whether the window was asked to the screen: it is there, or will be as soon as its parent
    /// is.
    [[nodiscard]] bool isOrderedIn() const { return m_isOrderedIn; }
    void setOrderedIn(bool isOrderedIn) { m_isOrderedIn = isOrderedIn; }
    /// Whether the parent, if there is one, is on the screen.
    [[nodiscard]] bool canShow() const;

    /// Moves the children by `delta` of Qt's desktop.
    void takeAlong(QPoint delta) const;

private:
    QPointer<Window> m_parent;
    std::vector<QPointer<Window>> m_children;
    bool m_isOrderedIn = false;
};

/// Brings the windows above `window` to the front again, after `window` itself was brought there. A
/// window manager keeps this order by itself; where there is none, nobody else does.
void raiseChildrenOf(const Window &window);

} // namespace penwick::platform
