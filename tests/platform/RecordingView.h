// SPDX-License-Identifier: MIT
// A plain view that writes down what reaches it.
#pragma once

#include "platform/view/ViewOf.h"

#include <QWidget>

#include <cmath>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace penwick::platform {

/// Writes down its events, in order: "down 3,57 x1" (window coordinates and click count), "drag",
/// "up" and "move" likewise, "entered", "exited", "key 51", "came", "left" (its window), "resign".
class RecordingView : public ViewOf<QWidget>
{
public:
    using ViewOf::ViewOf;

    /// What was written down since the last call.
    [[nodiscard]] std::vector<std::string> take() { return std::exchange(m_log, {}); }

    /// To be done whenever something was written down; it is handed what was.
    void setReaction(std::function<void(const std::string &)> reaction)
    {
        m_reaction = std::move(reaction);
    }
    void setDragDistance(double distance) { m_dragDistance = distance; }
    [[nodiscard]] double dragDistance() const override { return m_dragDistance; }
    void setKeepsFirstResponder(bool keeps) { m_keepsFirstResponder = keeps; }

    void draw(const Rect &) override { }
    void mouseDown(const MouseEvent &event) override { note("down", event); }
    void mouseDragged(const MouseEvent &event) override { note("drag", event); }
    void mouseUp(const MouseEvent &event) override { note("up", event); }
    void mouseMoved(const MouseEvent &event) override { note("move", event); }
    void mouseEntered() override { note("entered"); }
    void mouseExited() override { note("exited"); }
    void keyUp(const KeyEvent &event) override { note("key " + std::to_string(event.keyCode)); }
    void viewDidMoveToWindow() override { note(window() ? "came" : "left"); }
    bool resignFirstResponder() override
    {
        note(window() ? "resign" : "resign outside");
        return !m_keepsFirstResponder;
    }

private:
    void note(const std::string &text)
    {
        m_log.push_back(text);
        if (m_reaction)
            m_reaction(text);
    }

    void note(const std::string &kind, const MouseEvent &event)
    {
        note(kind + ' ' + std::to_string(std::lround(event.locationInWindow.x)) + ','
            + std::to_string(std::lround(event.locationInWindow.y)) + " x"
            + std::to_string(event.clickCount));
    }

    std::vector<std::string> m_log;
    std::function<void(const std::string &)> m_reaction;
    bool m_keepsFirstResponder = false;
    double m_dragDistance = 0.0;
};

} // namespace penwick::platform
