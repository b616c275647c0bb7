// SPDX-License-Identifier: MIT
// The second model's text of one box. The editor itself is not made a second time.
#pragma once

#include <functional>
#include <set>
#include <string>
#include <utility>

namespace penwick::test {

/// Whether `now` is `before` with one stretch of it, which may be nothing, replaced by `put`.
[[nodiscard]] bool isReplaced(
    const std::string &before, const std::string &put, const std::string &now);

/// The text of a box, and what an input method is composing in it.
///
/// The caret and the selection are not modelled. After a step that depends on them, the text that
/// the real editor has is taken over, if the step may leave such a text.
class PlainText
{
public:
    [[nodiscard]] const std::string &now() const { return m_now; }
    [[nodiscard]] const std::string &composed() const { return m_composed; }
    [[nodiscard]] bool isEmpty() const { return m_now.empty() && m_composed.empty(); }

    /// An edit begins. The editor's own undo reaches back to here, not into an edit before.
    void begin() { m_stood = { m_now }; }

    // With the caret at the end: nothing is left to the editor
    void append(const std::string &put);
    void backspace();

    // With the caret wherever it is
    void replace(const std::string &put);
    void goBack(); ///< the editor's own undo or redo
    void compose(const std::string &half);
    void commit(const std::string &whole); ///< in the place of what was composed
    void commit() { commit(std::string(m_composed)); } ///< what was composed

    /// Whether anything was done to the text since this was asked last.
    [[nodiscard]] bool wasTouched() { return std::exchange(m_isTouched, false); }

    /// Whether the last step left something to the editor.
    [[nodiscard]] bool isOpen() const { return static_cast<bool>(m_may); }
    /// Takes the editor's text over, if it may be this one; once after each step that left it open.
    void adopt(const std::string &now, const std::string &composed);

private:
    std::string m_now;
    std::string m_composed;
    std::set<std::string> m_stood = { "" }; // since the edit began
    std::function<bool(const std::string &now)> m_may;
    bool m_isTouched = false;
};

} // namespace penwick::test
