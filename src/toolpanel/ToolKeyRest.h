// SPDX-License-Identifier: MIT
// Whether what is typed works the tool bar.
#pragma once

namespace penwick {

/// Plain letters and digits work the tool bar, but rest after an edit of a text: somebody who goes
/// on typing when the edit has ended means text, and must not choose tools by it. They work again
/// once the pointer is used on board or bar. Keys with Ctrl, and Escape, never rest.
class ToolKeyRest
{
public:
    [[nodiscard]] bool rests() const { return m_rests; }

    /// A press on the board, on what is being edited on it, or anywhere on bar and popover.
    void pointerPressed() { m_rests = false; }
    /// A press on a text box that is not being edited: it looks as if it took letters.
    void placedBoxPressed() { m_rests = true; }
    /// A key of the box that is being edited, the one that ends the edit included.
    void keyEdited() { m_rests = true; }
    /// The keyboard has entered the tool bar.
    void keyboardEnteredBar() { m_rests = false; }

private:
    bool m_rests = false;
};

} // namespace penwick
