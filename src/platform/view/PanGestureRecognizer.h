// SPDX-License-Identifier: MIT
// Tells a drag of a view from a click on it.
#pragma once

#include <penwick/platform/Geometry.h>

#include <functional>

namespace penwick::platform {

class View;

/// Follows the pointer over one view. Its action runs for each step of a drag: first with the
/// state Began at the place of the press, then with Changed wherever the pointer goes, at last
/// with Ended. A press without a drag runs nothing.
///
/// Owned by whoever made it, who takes it off its view before it goes. GUI thread only.
class PanGestureRecognizer
{
public:
    enum class State
    {
        Possible = 0,
        Began = 1,
        Changed = 2,
        Ended = 3
    };
    using Action = std::function<void(const PanGestureRecognizer &)>;

    explicit PanGestureRecognizer(Action action);

    [[nodiscard]] State state() const { return m_state; }
    /// Where the pointer is, in `view`'s coordinates; in the window's where it is null.
    [[nodiscard]] Point locationIn(const View *view) const;

    // What the view reports; locations are in the window.
    void pressed(Point location);
    void dragged(Point location);
    void released(Point location);

private:
    void enter(State state, Point location);

    Action m_action;
    State m_state = State::Possible;
    Point m_location;
    Point m_pressLocation;
    bool m_isPressed = false;
};

} // namespace penwick::platform
